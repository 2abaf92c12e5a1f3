#include "latchedhealth/HealthLatching.h"

#include <syslog.h>

#include <cstdio>
#include <ctime>
#include <memory>
#include <new>
#include <optional>
#include <string>

#include "CmpiStatus.h"
#include "CmpiString.h"
#include "latchedhealth/ElementIdentity.h"
#include "latchedhealth/LatchedHealthState.h"

namespace TvLatchedHealth {

namespace {

std::int32_t now() { return static_cast<std::int32_t>(std::time(nullptr)); }

std::uint32_t takeEventId() { return nextEventId++; }

template <std::size_t Size>
void copyField(char (&field)[Size], const CmpiString &text) {
    std::snprintf(field, Size, "%s", text.isNull() ? "" : text.charPtr());
}

// Copies the element's keys into the record; false (after logging why)
// when the element cannot be kept.
bool copyKeys(const CmpiObjectPath &element, HealthInfo &record) {
    unsigned int count = 0;
    try {
        count = element.getKeyCount();
        if (count == 0) return false;
        record.keys.reserve(count);
    } catch (const CmpiStatus &) {
        return false;
    } catch (const std::bad_alloc &) {
        syslog(LOG_ERR, "Latched health state failed to allocate memory for object keys\n");
        return false;
    }
    for (unsigned int index = 0; index < count; ++index) {
        CmpiString name;
        std::optional<CmpiData> value;
        try {
            value = element.getKey(index, &name);
        } catch (const CmpiStatus &) {
        }
        if (!value || value->isNullValue() || value->isNotFound() || name.isNull()) {
            syslog(LOG_ERR, "Latched health state failed to allocate memory for object keys\n");
            return false;
        }
        try {
            const CmpiString text = *value;
            record.keys.push_back(HealthKey{name.charPtr(), text.isNull() ? "" : text.charPtr()});
        } catch (...) {
            syslog(LOG_ERR, "%s has a non string key, this in not supported\n", record.className);
            return false;
        }
    }
    return true;
}

void drop(const HealthInfo &record, std::uint16_t value) {
    syslog(LOG_ERR, "Failed to copy object, dropping health state %u for %s\n",
           static_cast<unsigned>(value), record.className);
}

void createRecord(const CmpiObjectPath &element, std::uint16_t value,
                  const std::optional<std::string> &identity) {
    auto record = std::make_unique<HealthInfo>();
    copyField(record->className, element.getClassName());
    copyField(record->nameSpace, element.getNameSpace());
    record->eventId = takeEventId();
    record->healthState = value;
    record->timestamp = now();
    try {
        const CmpiString host = element.getHostname();
        if (host.isNull()) {
            std::snprintf(record->hostName, sizeof record->hostName, "NULL");
        } else {
            copyField(record->hostName, host);
        }
    } catch (const CmpiStatus &) {
        // Kept empty; the copy check below decides whether that is faithful.
    }
    // A record whose rebuilt path would not name the element again could
    // never be found, followed or escalated: the element is dropped rather
    // than kept as a stranger.
    if (!copyKeys(element, *record) || !identity || recordIdentity(*record) != *identity) {
        drop(*record, value);
        return;
    }
    healthList.append(std::move(record), *identity);
}

}  // namespace

void latchElement(const CmpiObjectPath &element, std::uint16_t value) {
    const std::optional<std::string> identity = elementIdentity(element);
    HealthInfo *record = identity ? healthList.findElement(*identity) : nullptr;
    if (record == nullptr) {
        createRecord(element, value, identity);
    } else if (value > record->healthState) {
        record->healthState = value;
        record->eventId = takeEventId();
        record->timestamp = now();
    }
}

}  // namespace TvLatchedHealth
