// The heartbeat period read from configuration files the test writes: each
// case gives its period and exactly the log lines prescribed for it. The
// rows are the edges of the reader: bounds, overflow, malformed lines, and a
// file that cannot be opened.
#include <gtest/gtest.h>

#include <syslog.h>

#include <cstdio>
#include <fstream>
#include <string>
#include <vector>

#include "SyslogCapture.h"
#include "heartbeat/HeartbeatInterval.h"

namespace {

using namespace std::string_literals;
using syslogcapture::LoggedLine;
using syslogcapture::takeLoggedLines;

constexpr std::int32_t kCurrent = 300;

std::vector<LoggedLine> belowMinimum(const std::string &value) {
    return {{LOG_WARNING, "heartbeat_interval (" + value + ") is below minimum value (30), using the default."}};
}

TEST(HeartbeatInterval, ConfigurationFilesGiveThePeriodAndLogAsPrescribed) {
    const std::string unopenable = testing::TempDir() + "heartbeat_no/such.cfg";  // in no directory
    const struct {
        const char *name;
        std::string content;
        std::int32_t period;
        std::vector<LoggedLine> logged;
    } cases[] = {
        {"ColonAndBlank", "heartbeatInterval: 60\n", 60, {}},
        {"Minimum", "heartbeatInterval: 30\n", 30, {}},
        {"LargestThatFits", "heartbeatInterval: 2147483647\n", 2147483647, {}},
        {"VeryLongLine", "heartbeatInterval:" + std::string(1 << 20, ' ') + "120\n", 120, {}},
        {"GarbageAroundTheKey", "\x01\xff\0heartbeatInterval\0=\x80 77\xfe\n"s, 77, {}},
        {"BelowMinimum", "heartbeatInterval: 29\n", kCurrent, belowMinimum("29")},
        {"OneMoreThanFits", "heartbeatInterval: 2147483648\n", kCurrent, belowMinimum("-1")},
        {"CommentBeforeTheKey", "# heartbeatInterval: 60\nheartbeatInterval: 90\n", kCurrent, {}},
        {"NoKey", "httpPort: 5988\n", kCurrent, {}},
        {"no/such", "", kCurrent,
         {{LOG_ERR, "Open file to read: " + unopenable + " failed, using default: 300 seconds"}}},
    };
    takeLoggedLines();
    for (const auto &c : cases) {
        const std::string path = testing::TempDir() + "heartbeat_" + c.name + ".cfg";
        std::ofstream(path, std::ios::binary) << c.content;
        EXPECT_EQ(Heartbeat::readHeartbeatInterval(path.c_str(), kCurrent), c.period) << c.name;
        EXPECT_EQ(takeLoggedLines(), c.logged) << c.name;
        std::remove(path.c_str());
    }
}

}  // namespace
