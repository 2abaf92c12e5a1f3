// Values of every kind as tvxcim --json writes them, above all those a
// careless rendering gets wrong: 64-bit integers past a double's precision,
// reals JSON has no number for, NULL scalars, arrays and elements, embedded
// instances, and bytes that are not UTF-8. Reference values and property
// order show in the command output tests.
#include <gtest/gtest.h>

#include <cstdint>
#include <limits>

#include "tvxcim/InstanceJson.h"

namespace {

using namespace tvxbroker;
using tvxcim::Json;

struct ValueCase {
    const char *name;
    CimValue value;
    const char *json;
};

void PrintTo(const ValueCase &test, std::ostream *os) { *os << test.name; }

class ValueJsonTest : public testing::TestWithParam<ValueCase> {};

TEST_P(ValueJsonTest, WritesTypeAndValue) {
    EXPECT_EQ(tvxcim::valueJson(GetParam().value), Json::parse(GetParam().json));
}

const auto nan = std::numeric_limits<double>::quiet_NaN();
const auto infinity = std::numeric_limits<double>::infinity();

INSTANTIATE_TEST_SUITE_P(
    Kinds, ValueJsonTest,
    testing::Values(
        ValueCase{"Uint64Max", CimValue::makeUnsigned(CMPI_uint64, UINT64_MAX),
                  R"({"type":"uint64","value":"18446744073709551615"})"},
        ValueCase{"Sint64Min", CimValue::makeSigned(CMPI_sint64, INT64_MIN),
                  R"({"type":"sint64","value":"-9223372036854775808"})"},
        ValueCase{"Uint32IsNumber", CimValue::makeUnsigned(CMPI_uint32, 4294967295U),
                  R"({"type":"uint32","value":4294967295})"},
        ValueCase{"Sint8IsNumber", CimValue::makeSigned(CMPI_sint8, -128), R"({"type":"sint8","value":-128})"},
        ValueCase{"Real64", CimValue::makeReal(CMPI_real64, 0.1), R"({"type":"real64","value":0.1})"},
        ValueCase{"RealNaN", CimValue::makeReal(CMPI_real32, nan), R"({"type":"real32","value":"NaN"})"},
        ValueCase{"RealMinusInfinity", CimValue::makeReal(CMPI_real64, -infinity),
                  R"({"type":"real64","value":"-Infinity"})"},
        ValueCase{"Char16", CimValue::makeUnsigned(CMPI_char16, 0xE9), R"({"type":"char16","value":"\u00e9"})"},
        ValueCase{"Interval", CimValue::makeDateTime(DateTime{86400000000ULL + 1, true}),
                  R"({"type":"datetime","value":"00000001000000.000001:000"})"},
        ValueCase{"NullString", CimValue::makeNull(CMPI_string), R"({"type":"string","value":null})"},
        ValueCase{"NullArray", CimValue::makeNull(CMPI_uint64A), R"({"type":"uint64[]","value":null})"},
        ValueCase{"ArrayWithNullElement",
                  CimValue::makeArray(CMPI_uint64, {CimValue::makeUnsigned(CMPI_uint64, 1), CimValue::makeNull(CMPI_uint64)}),
                  R"({"type":"uint64[]","value":["1",null]})"},
        ValueCase{"EmptyArray", CimValue::makeArray(CMPI_string, {}), R"({"type":"string[]","value":[]})"},
        ValueCase{"EmbeddedInstance",
                  CimValue::makeInstance(Instance{ObjectPath{"", "", "Test_Event", {}},
                                                  {{"Sequence", CimValue::makeUnsigned(CMPI_uint32, 7)}}}),
                  R"({"type":"instance","value":{"className":"Test_Event",
                      "path":{"text":"Test_Event","namespace":"","className":"Test_Event","keys":{}},
                      "properties":{"Sequence":{"type":"uint32","value":7}}}})"},
        ValueCase{"UntypedNull", CimValue{}, R"({"type":null,"value":null})"}),
    [](const auto &test) { return std::string(test.param.name); });

TEST(InstanceJsonTest, LineReplacesBytesThatAreNotUtf8) {
    const Json json = tvxcim::valueJson(CimValue::makeString("a\xff" "b"));
    EXPECT_EQ(tvxcim::jsonLine(json), "{\"type\":\"string\",\"value\":\"a\xEF\xBF\xBD" "b\"}");
}

}  // namespace
