#include "heartbeat/HeartbeatInterval.h"

#include <syslog.h>

#include <cctype>
#include <fstream>
#include <limits>
#include <optional>
#include <string>

#include "heartbeat/HeartbeatState.h"

namespace Heartbeat {
namespace {

constexpr const char *kKey = "heartbeatInterval";
constexpr std::int32_t kDoesNotFit = -1;

bool isDigit(char c) { return std::isdigit(static_cast<unsigned char>(c)) != 0; }

// The first run of digits before any "#", as a number; -1 when it does not
// fit a signed 32-bit number.
std::optional<std::int32_t> valueOf(const std::string &line) {
    std::size_t at = 0;
    while (at < line.size() && line[at] != '#' && !isDigit(line[at])) ++at;
    // A run at the very first character is not taken.
    if (at == 0 || at == line.size() || !isDigit(line[at])) return std::nullopt;
    std::int64_t value = 0;
    for (; at < line.size() && isDigit(line[at]); ++at) {
        value = value * 10 + (line[at] - '0');
        if (value > std::numeric_limits<std::int32_t>::max()) return kDoesNotFit;
    }
    return static_cast<std::int32_t>(value);
}

}  // namespace

std::int32_t readHeartbeatInterval(const char *path, std::int32_t current) {
    std::ifstream file(path, std::ios::binary);
    if (!file.is_open()) {
        syslog(LOG_ERR, "Open file to read: %s failed, using default: %d seconds", path, current);
        return current;
    }
    return readHeartbeatInterval(file, current);
}

std::int32_t readHeartbeatInterval(std::istream &file, std::int32_t current) {
    std::string line;
    bool found = false;
    while (!found && std::getline(file, line)) found = line.find(kKey) != std::string::npos;
    if (!found) return current;
    const std::optional<std::int32_t> value = valueOf(line);
    if (!value) return current;
    if (*value < kMinimumHeartbeatSeconds) {
        syslog(LOG_WARNING, "heartbeat_interval (%d) is below minimum value (%d), using the default.",
               *value, kMinimumHeartbeatSeconds);
        return current;
    }
    return *value;
}

void readHeartbeatInterval() {
    heartbeatIntervalSeconds = readHeartbeatInterval(kBrokerConfigFile, heartbeatIntervalSeconds);
}

}  // namespace Heartbeat
