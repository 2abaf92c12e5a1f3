#include "latchedhealth/HealthPaths.h"

#include <cstdlib>
#include <cstring>
#include <limits>

#include "CmpiStatus.h"
#include "CmpiString.h"

namespace TvLatchedHealth {

bool getEventIdKey(const CmpiObjectPath &path, std::uint32_t &eventId) {
    eventId = 0;
    const CmpiData key = path.getKey("EventId");
    if (key.isNullValue() || key.isNotFound()) return false;
    const CmpiString text = key;
    long number = std::strtol(text.isNull() ? "" : text.charPtr(), nullptr, 10);
    // long is wider than 32 bits on 64-bit builds; the 32-bit host clamps
    // there already.
    if (number > std::numeric_limits<std::int32_t>::max()) number = std::numeric_limits<std::int32_t>::max();
    if (number < std::numeric_limits<std::int32_t>::min()) number = std::numeric_limits<std::int32_t>::min();
    eventId = static_cast<std::uint32_t>(static_cast<std::int32_t>(number));
    return true;
}

bool setPathFromHealthInfo(const HealthInfo &record, CmpiObjectPath &path) {
    try {
        if (std::strncmp(record.hostName, "NULL", 4) != 0) path.setHostname(record.hostName);
        for (const HealthKey &key : record.keys) {
            path.setKey(key.keyName.c_str(), CmpiData(key.keyValue.c_str()));
        }
    } catch (const CmpiStatus &) {
        return false;
    }
    return true;
}

}  // namespace TvLatchedHealth
