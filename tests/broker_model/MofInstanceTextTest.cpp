#include <gtest/gtest.h>

#include <string>

#include "model/MofInstanceText.h"

namespace tvxbroker {
namespace {

ObjectPath pathOf(const std::string &cls, const std::string &key) {
    return ObjectPath{"", "root/cimv2", cls, {{"Name", CimValue::makeString(key)}}};
}

// Unsigned integers, booleans and string arrays show in tvxcim's output tests.
TEST(MofInstanceText, WritesEveryKindOfValue) {
    const Instance inner{pathOf("TST_Inner", "in"), {}};
    Instance instance;
    instance.path = pathOf("TST_Thing", "line1\nline2 \"q\"");
    instance.properties = {
        {"Name", CimValue::makeString("line1\nline2 \"q\"")},
        {"Missing", CimValue::makeNull(CMPI_string)},
        {"Delta", CimValue::makeSigned(CMPI_sint8, -3)},
        {"Ratio", CimValue::makeReal(CMPI_real64, 2.5)},
        {"Letter", CimValue::makeUnsigned(CMPI_char16, '\'')},
        {"When", CimValue::makeDateTime({0, false})},
        {"Other", CimValue::makeReference(pathOf("TST_Other", "o\\"))},
        {"Inner", CimValue::makeInstance(inner)},
        {"Tags", CimValue::makeArray(CMPI_string, {CimValue::makeString("a\t"), CimValue::makeNull(CMPI_string),
                                       CimValue::makeString("\x01" "f")})},
        {"Empty", CimValue::makeArray(CMPI_uint8, {})},
        {"NoArray", CimValue::makeNull(CMPI_uint8A)},
    };
    EXPECT_EQ(formatInstanceMof(instance),
              "// root/cimv2:TST_Thing.Name=\"line1 line2 \\\"q\\\"\"\n"
              "instance of TST_Thing\n"
              "{\n"
              "    Name = \"line1\\nline2 \\\"q\\\"\";\n"
              "    Missing = NULL;\n"
              "    Delta = -3;\n"
              "    Ratio = 2.5;\n"
              "    Letter = '\\'';\n"
              "    When = \"19700101000000.000000+000\";\n"
              "    Other = \"root/cimv2:TST_Other.Name=\\\"o\\\\\\\\\\\"\";\n"
              "    Inner = \"root/cimv2:TST_Inner.Name=\\\"in\\\"\";\n"
              "    Tags = {\"a\\t\", NULL, \"\\x0001f\"};\n"
              "    Empty = {};\n"
              "    NoArray = NULL;\n"
              "};\n");
}

}  // namespace
}  // namespace tvxbroker
