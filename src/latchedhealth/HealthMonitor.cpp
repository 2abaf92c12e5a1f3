#include "latchedhealth/HealthMonitor.h"

#include <syslog.h>

#include <algorithm>
#include <optional>

#include "CmpiEnumeration.h"
#include "CmpiInstance.h"
#include "latchedhealth/HealthLatching.h"
#include "latchedhealth/LatchedHealthState.h"
#include "latchedhealth/PollingThread.h"
#include "platform/ThreadCycleObjects.h"

namespace TvLatchedHealth {

const std::array<WatchedClass, 12> watchedClasses = {{
    {"CIM_Sensor", "root/cimv2"},
    {"CIM_PhysicalMemory", "root/cimv2"},
    {"CIM_Processor", "root/cimv2"},
    {"CIM_PowerSupply", "root/cimv2"},
    {"Talvex_PortController", "root/cimv2"},
    {"Talvex_Controller", "root/cimv2"},
    {"Talvex_Battery", "root/cimv2"},
    {"Talvex_StorageVolume", "root/cimv2"},
    {"Talvex_StorageExtent", "root/cimv2"},
    {"Talvex_DiskDrive", "root/cimv2"},
    {"Talvex_SASSATAPort", "root/cimv2"},
    {"Talvex_StoragePool", "root/cimv2"},
}};

namespace {

// Worst value seen so far in the running poll; guarded by healthMutex.
std::uint16_t passMaxHealthState = 0;

// Nothing for a null, missing or not unsigned 16-bit HealthState: such an
// instance does not count at all.
std::optional<std::uint16_t> reportedHealth(const CmpiInstance &instance) {
    try {
        const CmpiData value = instance.getProperty("HealthState");
        if (value.isNullValue() || value.isNotFound()) return std::nullopt;
        return static_cast<CMPIUint16>(value);
    } catch (...) {
        return std::nullopt;
    }
}

// Any failure ends this class's poll quietly: the broker may serve the
// class next time, and elements already latched stay latched.
void pollClass(const CmpiBroker &broker, const CmpiContext &ctx, const WatchedClass &watched) {
    try {
        const CmpiEnumeration instances =
            broker.enumInstances(ctx, CmpiObjectPath(watched.nameSpace, watched.className), nullptr);
        while (instances.hasNext()) {
            const CmpiInstance instance = instances.getNext();
            const std::optional<std::uint16_t> health = reportedHealth(instance);
            if (!health) continue;
            passMaxHealthState = std::max(passMaxHealthState, *health);
            if (*health == kHealthOk) continue;
            latchElement(instance.getObjectPath(), *health);
        }
    } catch (...) {
    }
}

}  // namespace

void pollWatchedClasses(const CmpiBroker &broker, const CmpiContext &ctx) {
    passMaxHealthState = 0;
    for (const WatchedClass &watched : watchedClasses) {
        try {
            platform::ThreadCycleObjects objects(broker, ctx);
            pollClass(broker, ctx, watched);
            objects.release();
        } catch (...) {
            syslog(LOG_ERR, "Failed to check health status of class %s\n", watched.className);
        }
    }
    rollupHealthState.store(passMaxHealthState);
}

void *HealthMonitorThread(void *startArgs) {
    runPollingThread(startArgs, pollWatchedClasses, kHealthPollSeconds);
    return nullptr;
}

}  // namespace TvLatchedHealth
