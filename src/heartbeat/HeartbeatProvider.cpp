#include "heartbeat/HeartbeatProvider.h"

#include <syslog.h>

#include "heartbeat/HeartbeatInterval.h"
#include "heartbeat/HeartbeatState.h"
#include "heartbeat/HeartbeatThread.h"
#include "platform/ProviderThread.h"

namespace Heartbeat {

HeartbeatProvider::HeartbeatProvider(const CmpiBroker &mb, const CmpiContext &ctx)
    : CmpiBaseMI(mb, ctx), AcceptingIndicationMI(mb, ctx) {}

HeartbeatProvider::~HeartbeatProvider() = default;

CmpiStatus HeartbeatProvider::initialize(const CmpiContext &ctx) {
    readHeartbeatInterval();
    const OMC::MutexLock lock(heartbeatMutex);
    // A stopped heartbeat stays stopped: a thread started now would only end.
    if (heartbeatRunning || heartbeatStop) return CmpiStatus(CMPI_RC_OK);
    if (platform::startProviderThread(heartbeatThreadHandle, heartBeatThread, broker, ctx) != 0) {
        constexpr const char *failure = "Failed to start heartbeat indication thread";
        syslog(LOG_ERR, "%s", failure);
        throw CmpiStatus(CMPI_RC_ERR_FAILED, failure);
    }
    // Marked here rather than by the thread, so that a cleanup that comes
    // before the thread has run still waits for it.
    heartbeatRunning = true;
    return CmpiStatus(CMPI_RC_OK);
}

CmpiStatus HeartbeatProvider::cleanup(const CmpiContext &, bool terminating) {
    if (!terminating) return CmpiStatus(CMPI_RC_NEVER_UNLOAD);
    platform::stopProviderThreads(heartbeatMutex, heartbeatCondition, heartbeatStop,
                                  [] { return heartbeatRunning; }, {&heartbeatThreadHandle});
    return CmpiStatus(CMPI_RC_OK);
}

}  // namespace Heartbeat
