// The heartbeat period, set by the key "heartbeatInterval" in the broker's
// configuration file.
#pragma once

#include <cstdint>
#include <istream>

namespace Heartbeat {

inline constexpr const char *kBrokerConfigFile = "/etc/sfcb/sfcb.cfg";

// The period the configuration file at `path` gives, or `current` when it
// gives none that can be used; a file that cannot be opened and a value
// below the minimum are logged. Only the first line that holds the key
// counts; its value is the first run of digits before any "#", unless the
// line begins with that run.
std::int32_t readHeartbeatInterval(const char *path, std::int32_t current);

// The same for the text of an opened configuration file.
std::int32_t readHeartbeatInterval(std::istream &file, std::int32_t current);

// Updates heartbeatIntervalSeconds from the broker's configuration file.
void readHeartbeatInterval();

}  // namespace Heartbeat
