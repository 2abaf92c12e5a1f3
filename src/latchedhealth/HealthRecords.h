// The latched records in the order of their creation, with an index from an
// element's identity to its record, so that a poll finds each element's
// record without rebuilding and comparing every record's path.
#pragma once

#include <cstdint>
#include <list>
#include <memory>
#include <string>
#include <unordered_map>

#include "latchedhealth/HealthInfo.h"

namespace TvLatchedHealth {

class HealthRecords {
public:
    using List = std::list<std::unique_ptr<HealthInfo>>;

    List::const_iterator begin() const { return records.begin(); }
    List::const_iterator end() const { return records.end(); }
    bool empty() const { return records.empty(); }

    // The record of the element with this identity (see ElementIdentity.h).
    HealthInfo *findElement(const std::string &identity) const;
    // The first record in list order carrying the event number.
    HealthInfo *findEvent(std::uint32_t eventId) const;
    // Appends at the end; an identity already known keeps its first record,
    // as a walk of the list would find that one first.
    void append(std::unique_ptr<HealthInfo> record, std::string identity);

private:
    List records;
    std::unordered_map<std::string, HealthInfo *> byIdentity;
};

}  // namespace TvLatchedHealth
