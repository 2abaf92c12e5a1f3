// Reading and rebuilding the paths that name latched records and their
// elements.
#pragma once

#include <cstdint>

#include "CmpiObjectPath.h"
#include "latchedhealth/HealthInfo.h"

namespace TvLatchedHealth {

// The event number of a record's path: false (and 0) when "EventId" is
// missing or null. The text is read as strtol does in base 10 (leading
// blanks and a sign, up to the first non-digit, no digits giving 0) and
// clamped to the signed 32-bit range. A key that is not text throws the
// binding's CmpiStatus.
bool getEventIdKey(const CmpiObjectPath &path, std::uint32_t &eventId);

// Completes a path built from the record's namespace and class with its
// host name (unless it begins with "NULL") and its keys as text. False when
// the broker refuses one of them.
bool setPathFromHealthInfo(const HealthInfo &record, CmpiObjectPath &path);

}  // namespace TvLatchedHealth
