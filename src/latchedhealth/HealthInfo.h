// One latched record: the worst health an element has reported, and the
// element's path in plain copies, since nothing the broker hands a polling
// thread outlives the class it polled.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace TvLatchedHealth {

// Field sizes, terminating zero included: longer texts are cut.
inline constexpr std::size_t kClassNameSize = 80;
inline constexpr std::size_t kNameSpaceSize = 32;
inline constexpr std::size_t kHostNameSize = 80;

// HealthState value that is never latched.
inline constexpr std::uint16_t kHealthOk = 5;

struct HealthKey {
    std::string keyName;
    std::string keyValue;
};

struct HealthInfo {
    char className[kClassNameSize] = {};
    char nameSpace[kNameSpaceSize] = {};
    // "NULL" when the element's path had no host name; empty when reading
    // it failed.
    char hostName[kHostNameSize] = {};
    // The element path's keys in its order; never empty for a listed record.
    std::vector<HealthKey> keys;
    std::uint32_t eventId = 0;
    std::uint16_t healthState = 0;
    std::int32_t timestamp = 0;  // seconds since the epoch
};

}  // namespace TvLatchedHealth
