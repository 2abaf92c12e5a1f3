// The heartbeat period read from configuration files the test writes: each
// case gives its period and exactly the log lines prescribed for it.
#include <gmock/gmock.h>
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

LoggedLine belowMinimum(const std::string &value) {
    return {LOG_WARNING, "heartbeat_interval (" + value + ") is below minimum value (30), using the default."};
}

struct IntervalCase {
    const char *name;
    std::string content;
    std::int32_t period;
    std::vector<LoggedLine> logged;
};

void PrintTo(const IntervalCase &test, std::ostream *os) { *os << test.name; }

std::string binaryGarbage() {
    std::string bytes;
    for (int i = 0; i < 4096; ++i) bytes.push_back(static_cast<char>((i * 7919) % 256));
    return bytes;
}

class HeartbeatIntervalTest : public testing::TestWithParam<IntervalCase> {};

TEST_P(HeartbeatIntervalTest, GivesThePeriodAndLogsAsPrescribed) {
    const std::string path = testing::TempDir() + "heartbeat_" + GetParam().name + ".cfg";
    std::ofstream(path, std::ios::binary) << GetParam().content;
    takeLoggedLines();
    EXPECT_EQ(Heartbeat::readHeartbeatInterval(path.c_str(), kCurrent), GetParam().period);
    EXPECT_THAT(takeLoggedLines(), testing::ElementsAreArray(GetParam().logged));
    std::remove(path.c_str());
}

INSTANTIATE_TEST_SUITE_P(
    ConfigurationFiles, HeartbeatIntervalTest,
    testing::Values(
        IntervalCase{"ColonAndBlank", "heartbeatInterval: 60\n", 60, {}},
        IntervalCase{"EqualsAndTrailingComment", "heartbeatInterval=60 # once a minute\n", 60, {}},
        IntervalCase{"AmongOtherSettings", "httpPort: 5988\n# heartbeat\n\nheartbeatInterval: 45\nhttpsPort: 5989\n", 45, {}},
        IntervalCase{"Minimum", "heartbeatInterval: 30\n", 30, {}},
        IntervalCase{"LargestThatFits", "heartbeatInterval: 2147483647\n", 2147483647, {}},
        IntervalCase{"LeadingZeros", "heartbeatInterval: 000000000000000060\n", 60, {}},
        IntervalCase{"MinusSignIsNotPartOfTheValue", "heartbeatInterval: -45\n", 45, {}},
        IntervalCase{"KeyInsideAWord", "  myheartbeatIntervalX 40\n", 40, {}},
        IntervalCase{"FirstDigitsBeforeTheKey", "x 50 heartbeatInterval 70\n", 50, {}},
        IntervalCase{"NoLineFeedAtTheEnd", "heartbeatInterval: 75", 75, {}},
        IntervalCase{"CarriageReturns", "heartbeatInterval: 75\r\n", 75, {}},
        IntervalCase{"VeryLongLine", "heartbeatInterval:" + std::string(1 << 20, ' ') + "120\n", 120, {}},
        IntervalCase{"GarbageAroundTheKey", "\x01\xff\0heartbeatInterval\0=\x80 77\xfe\n"s, 77, {}},
        IntervalCase{"BelowMinimum", "heartbeatInterval: 29\n", kCurrent, {belowMinimum("29")}},
        IntervalCase{"Zero", "heartbeatInterval: 0\n", kCurrent, {belowMinimum("0")}},
        IntervalCase{"ElevenNines", "heartbeatInterval: 99999999999\n", kCurrent, {belowMinimum("-1")}},
        IntervalCase{"OneMoreThanFits", "heartbeatInterval: 2147483648\n", kCurrent, {belowMinimum("-1")}},
        IntervalCase{"EndlessDigits", "heartbeatInterval: " + std::string(100000, '9'), kCurrent, {belowMinimum("-1")}},
        IntervalCase{"CommentBeforeTheKey", "# heartbeatInterval: 60\nheartbeatInterval: 90\n", kCurrent, {}},
        IntervalCase{"CommentBeforeTheValue", "heartbeatInterval: # 60\n", kCurrent, {}},
        IntervalCase{"FirstKeyLineWithoutValue", "heartbeatInterval:\nheartbeatInterval: 60\n", kCurrent, {}},
        IntervalCase{"DigitsAtTheFirstCharacter", "60 heartbeatInterval\n", kCurrent, {}},
        IntervalCase{"DigitsRightBeforeTheKey", "90heartbeatInterval: 60\n", kCurrent, {}},
        IntervalCase{"KeyInOtherCase", "HeartbeatInterval: 60\n", kCurrent, {}},
        IntervalCase{"NoKey", "httpPort: 5988\n", kCurrent, {}},
        IntervalCase{"Empty", "", kCurrent, {}},
        IntervalCase{"BinaryGarbage", binaryGarbage(), kCurrent, {}}),
    [](const auto &test) { return std::string(test.param.name); });

TEST(HeartbeatInterval, AFileThatCannotBeOpenedKeepsTheCurrentPeriodAndSaysSo) {
    const std::string path = testing::TempDir() + "no/such/sfcb.cfg";
    takeLoggedLines();
    EXPECT_EQ(Heartbeat::readHeartbeatInterval(path.c_str(), 120), 120);
    EXPECT_THAT(takeLoggedLines(),
                testing::ElementsAre(LoggedLine{LOG_ERR, "Open file to read: " + path + " failed, using default: 120 seconds"}));
}

}  // namespace
