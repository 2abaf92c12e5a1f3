// The heartbeat provider serves one interface: the indications of
// Talvex_CIMHeartbeat.
#include "CmpiProviderFactory.h"
#include "heartbeat/HeartbeatProvider.h"

CMProviderBase(Talvex_CIMHeartbeat);

CMIndicationMIFactory(Heartbeat::HeartbeatProvider, Talvex_CIMHeartbeat)
