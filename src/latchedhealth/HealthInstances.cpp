#include "latchedhealth/HealthInstances.h"

#include <cstdio>

#include "CmpiDateTime.h"
#include "CmpiInstance.h"
#include "latchedhealth/LatchedHealthState.h"

namespace TvLatchedHealth {

namespace {

struct EventIdText {
    char text[64];
};

EventIdText eventIdText(const HealthInfo &record) {
    EventIdText formatted{};
    std::snprintf(formatted.text, sizeof formatted.text, "%u", static_cast<unsigned>(record.eventId));
    return formatted;
}

}  // namespace

void returnHealthInstance(const CmpiObjectPath &requestPath, const char **properties,
                          const HealthInfo &record, CmpiResult &result) {
    CmpiInstance instance(requestPath);
    instance.setPropertyFilter(properties, nullptr);
    instance.setProperty("LatchedClassName", CmpiData(record.className));
    instance.setProperty("LatchedNamespace", CmpiData(record.nameSpace));
    instance.setProperty("EventId", CmpiData(eventIdText(record).text));
    instance.setProperty("HealthState", CmpiData(static_cast<CMPIUint16>(record.healthState)));
    // A point in time: seconds since the epoch, in microseconds.
    const auto seconds = static_cast<CMPIUint64>(static_cast<std::uint32_t>(record.timestamp));
    instance.setProperty("Timestamp", CmpiData(CmpiDateTime(seconds * 1000000u, false)));
    result.returnData(instance);
}

void returnHealthName(const CmpiObjectPath &requestPath, const HealthInfo &record,
                      CmpiResult &result) {
    CmpiObjectPath name(requestPath.getNameSpace(), requestPath.getClassName().charPtr());
    name.setKey("EventId", CmpiData(eventIdText(record).text));
    result.returnData(name);
}

void returnRollupInstance(const CmpiObjectPath &path, const char **properties, CmpiResult &result) {
    CmpiInstance instance(path);
    instance.setPropertyFilter(properties, nullptr);
    instance.setProperty("Name", CmpiData(kRollupName));
    instance.setProperty("HealthState", CmpiData(static_cast<CMPIUint16>(rollupHealthState.load())));
    result.returnData(instance);
}

void returnRollupName(const CmpiObjectPath &requestPath, CmpiResult &result) {
    CmpiObjectPath name(requestPath.getNameSpace(), kRollupHealthClass);
    name.setKey("Name", CmpiData(kRollupName));
    result.returnData(name);
}

}  // namespace TvLatchedHealth
