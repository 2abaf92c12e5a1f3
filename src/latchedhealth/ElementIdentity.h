// What makes two object paths the same element: class name (compared as
// written), namespace, host name and every key (names without regard to
// case, in any order, values as text). Folded into one text so that records
// can be found by hashing.
#pragma once

#include <optional>
#include <string>

#include "CmpiObjectPath.h"
#include "latchedhealth/HealthInfo.h"

namespace TvLatchedHealth {

// Nothing when a key is not text or the host name cannot be read: no
// record can hold such an element.
// Throws what the broker throws while the path is read.
std::optional<std::string> elementIdentity(const CmpiObjectPath &element);

// The identity of the path a record rebuilds (setPathFromHealthInfo): a
// host name beginning with "NULL" stands for none.
std::string recordIdentity(const HealthInfo &record);

}  // namespace TvLatchedHealth
