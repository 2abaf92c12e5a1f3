#include "latchedhealth/KernelIpMonitor.h"

#include <syslog.h>

#include "latchedhealth/LatchedHealthState.h"
#include "latchedhealth/PollingThread.h"
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
    runPollingThread(startArgs, kernelIpCycle, kKernelIpCycleSeconds);
    return nullptr;
}

}  // namespace TvLatchedHealth
