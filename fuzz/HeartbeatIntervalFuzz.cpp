// The broker configuration file the heartbeat period is read from.
#include <sstream>

#include "FuzzInput.h"
#include "heartbeat/HeartbeatInterval.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    std::istringstream file(tvxfuzz::textOf(data, size));
    Heartbeat::readHeartbeatInterval(file, 300);
    return 0;
}
