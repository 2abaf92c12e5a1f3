#include "heartbeat/HeartbeatState.h"

namespace Heartbeat {

// Defined in this order in one file, the mutex is built before the condition
// when the library is loaded and destroyed after it at unload. The factory's
// base object needs neither construction nor destruction (it is constant
// initialised), so it exists before both and after both.
OMC::Mutex heartbeatMutex;
OMC::Condition heartbeatCondition;
pthread_t heartbeatThreadHandle{};
bool heartbeatStop = false;
bool heartbeatRunning = false;
std::atomic<std::int32_t> heartbeatIntervalSeconds{kDefaultHeartbeatSeconds};

}  // namespace Heartbeat
