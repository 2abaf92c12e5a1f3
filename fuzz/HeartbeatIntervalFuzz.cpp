// The broker configuration file the heartbeat period is read from.
#include <syslog.h>

#include <sstream>

#include "FuzzInput.h"
#include "heartbeat/HeartbeatInterval.h"

// Values below the minimum are logged; millions of runs must not reach the
// system log.
extern "C" int LLVMFuzzerInitialize(int *, char ***) {
    setlogmask(LOG_MASK(LOG_EMERG));
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    std::istringstream file(tvxfuzz::textOf(data, size));
    Heartbeat::readHeartbeatInterval(file, 300);
    return 0;
}
