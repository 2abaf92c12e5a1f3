#include "heartbeat/HeartbeatThread.h"

#include "heartbeat/HeartbeatIndication.h"
#include "heartbeat/HeartbeatState.h"
#include "platform/ProviderThread.h"

namespace Heartbeat {

void *heartBeatThread(void *startArgs) {
    const ThreadStartArgs thread = platform::attachProviderThread(startArgs);
    HeartbeatIndication heartbeat(thread.broker, thread.context);
    const OMC::MutexLock lock(heartbeatMutex);
    while (!heartbeatStop) {
        heartbeat.beat(thread.broker, thread.context);
        platform::waitOnePeriod(heartbeatCondition, heartbeatMutex, heartbeatIntervalSeconds);
    }
    heartbeatRunning = false;
    return nullptr;
}

}  // namespace Heartbeat
