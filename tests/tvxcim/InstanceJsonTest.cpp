// Values as tvxcim --json writes them where a careless rendering goes wrong:
// 64-bit integers past a double's precision, reals JSON has no number for,
// NULL scalars, arrays and elements, embedded instances, and bytes that are
// not UTF-8. Reference values and property order show in the command output
// tests.
#include <gtest/gtest.h>

#include <cstdint>
#include <limits>

#include "tvxcim/InstanceJson.h"

namespace {

using namespace tvxbroker;
using tvxcim::Json;

TEST(InstanceJsonTest, WritesTypeAndValue) {
    const double nan = std::numeric_limits<double>::quiet_NaN();
    const Instance event{ObjectPath{"", "", "Test_Event", {}}, {{"Sequence", CimValue::makeUnsigned(CMPI_uint32, 7)}}};
    const std::pair<CimValue, const char *> cases[] = {
        {CimValue::makeUnsigned(CMPI_uint64, UINT64_MAX), R"({"type":"uint64","value":"18446744073709551615"})"},
        {CimValue::makeSigned(CMPI_sint64, INT64_MIN), R"({"type":"sint64","value":"-9223372036854775808"})"},
        {CimValue::makeReal(CMPI_real32, nan), R"({"type":"real32","value":"NaN"})"},
        {CimValue::makeUnsigned(CMPI_char16, 0xE9), R"({"type":"char16","value":"\u00e9"})"},
        {CimValue::makeNull(CMPI_string), R"({"type":"string","value":null})"},
        {CimValue::makeArray(CMPI_uint64, {CimValue::makeUnsigned(CMPI_uint64, 1), CimValue::makeNull(CMPI_uint64)}),
         R"({"type":"uint64[]","value":["1",null]})"},
        {CimValue::makeInstance(event), R"({"type":"instance","value":{"className":"Test_Event",
             "path":{"text":"Test_Event","namespace":"","className":"Test_Event","keys":{}},
             "properties":{"Sequence":{"type":"uint32","value":7}}}})"},
        {CimValue{}, R"({"type":null,"value":null})"},
    };
    for (const auto &[value, json] : cases) EXPECT_EQ(tvxcim::valueJson(value), Json::parse(json)) << json;
}

TEST(InstanceJsonTest, LineReplacesBytesThatAreNotUtf8) {
    const Json json = tvxcim::valueJson(CimValue::makeString("a\xff" "b"));
    EXPECT_EQ(tvxcim::jsonLine(json), "{\"type\":\"string\",\"value\":\"a\xEF\xBF\xBD" "b\"}");
}

}  // namespace
