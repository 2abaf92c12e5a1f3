#include <gtest/gtest.h>

#include <cstdint>
#include <stdexcept>
#include <string>
#include <utility>

#include "model/CimDateTime.h"

namespace tvxbroker {
namespace {

constexpr std::uint64_t second = 1000000;
constexpr std::uint64_t day = 86400 * second;

// The bounds of both kinds and the leap days around the century rule.
TEST(CimDateTime, CanonicalTextRoundTripsWithinItsRange) {
    const std::pair<std::string, DateTime> cases[] = {
        {"19700101000000.000000+000", {0, false}},
        {"20000229235959.999999+000", {(11016 * day) + 86399 * second + 999999, false}},
        {"21000301000000.000000+000", {47541 * day, false}},
        {"99991231235959.999999+000", {2932896 * day + 86399 * second + 999999, false}},
        {"99999999235959.999999:000", {99999999 * day + 86399 * second + 999999, true}},
    };
    for (const auto &[text, value] : cases) {
        EXPECT_EQ(formatCimDateTime(value), text);
        DateTime parsed;
        ASSERT_TRUE(parseCimDateTime(text, parsed)) << text;
        EXPECT_EQ(parsed, value) << text;
    }
    DateTime shifted;
    ASSERT_TRUE(parseCimDateTime("20240101120000.000000-090", shifted));
    EXPECT_EQ(shifted, (DateTime{19723 * day + 13 * 3600 * second + 1800 * second, false})) << "offset to UTC";
    EXPECT_THROW(formatCimDateTime({2932897 * day, false}), std::out_of_range);
    EXPECT_THROW(formatCimDateTime({100000000 * day, true}), std::out_of_range);
}

TEST(CimDateTime, MalformedTextIsRejectedAndLeavesValueAlone) {
    const std::string cases[] = {
        "2024010112000.000000+000",
        "20230229120000.000000+000",
        "21000229120000.000000+000",
        "19700101000000.000000+001",
        std::string("20240101120000.0000\0\00+000", 25),
    };
    for (const std::string &text : cases) {
        DateTime value{42, true};
        EXPECT_FALSE(parseCimDateTime(text, value)) << text;
        EXPECT_EQ(value, (DateTime{42, true})) << text;
    }
}

}  // namespace
}  // namespace tvxbroker
