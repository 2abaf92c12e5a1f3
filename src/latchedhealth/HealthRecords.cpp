#include "latchedhealth/HealthRecords.h"

namespace TvLatchedHealth {

HealthInfo *HealthRecords::findElement(const std::string &identity) const {
    auto found = byIdentity.find(identity);
    return found == byIdentity.end() ? nullptr : found->second;
}

HealthInfo *HealthRecords::findEvent(std::uint32_t eventId) const {
    for (const std::unique_ptr<HealthInfo> &record : records) {
        if (record->eventId == eventId) return record.get();
    }
    return nullptr;
}

void HealthRecords::append(std::unique_ptr<HealthInfo> record, std::string identity) {
    byIdentity.emplace(std::move(identity), record.get());
    records.push_back(std::move(record));
}

}  // namespace TvLatchedHealth
