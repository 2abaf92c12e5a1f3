#include "latchedhealth/PollingThread.h"

#include "latchedhealth/LatchedHealthState.h"
#include "platform/ProviderThread.h"

namespace TvLatchedHealth {

void runPollingThread(void *startArgs, Cycle cycle, int seconds) {
    const ThreadStartArgs thread = platform::attachProviderThread(startArgs);
    const OMC::MutexLock lock(healthMutex);
    ++runningThreads;
    while (!stopThreads) {
        cycle(thread.broker, thread.context);
        platform::waitOnePeriod(healthCondition, healthMutex, seconds);
    }
    --runningThreads;
}

}  // namespace TvLatchedHealth
