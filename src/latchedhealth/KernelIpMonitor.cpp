#include "latchedhealth/KernelIpMonitor.h"

#include <syslog.h>

#include "latchedhealth/LatchedHealthState.h"
#include "platform/ProviderThread.h"
#include "platform/ThreadCycleObjects.h"

namespace TvLatchedHealth {

void kernelIpCycle(const CmpiBroker &broker, const CmpiContext &ctx) {
    try {
        platform::ThreadCycleObjects objects(broker, ctx);
        CmpiBroker sender(broker);
        kernelIpIndication.testAndSend(ctx, &sender);
        objects.release();
    } catch (...) {
        syslog(LOG_ERR, "Failed testAndSend operation");
    }
}

void *KernelIpMonitorThread(void *startArgs) {
    const ThreadStartArgs thread = platform::attachProviderThread(startArgs);
    const OMC::MutexLock lock(healthMutex);
    ++runningThreads;
    while (!stopThreads) {
        kernelIpCycle(thread.broker, thread.context);
        platform::waitOnePeriod(healthCondition, healthMutex, kKernelIpCycleSeconds);
    }
    --runningThreads;
    return nullptr;
}

}  // namespace TvLatchedHealth
