#include <gtest/gtest.h>

#include <string>

#include "model/MofInstanceText.h"

namespace tvxbroker {
namespace {

ObjectPath pathOf(const std::string &cls, const std::string &key) {
    ObjectPath path;
    path.nameSpace = "root/cimv2";
    path.className = cls;
    path.keys.push_back({"Name", CimValue::makeString(key)});
    return path;
}

TEST(MofInstanceText, WritesEveryKindOfValue) {
    Instance inner;
    inner.path = pathOf("TST_Inner", "in");

    Instance instance;
    instance.path = pathOf("TST_Thing", "line1\nline2 \"q\"");
    instance.properties = {
        {"Name", CimValue::makeString("line1\nline2 \"q\"")},
        {"Missing", CimValue::makeNull(CMPI_string)},
        {"Count", CimValue::makeUnsigned(CMPI_uint32, 42)},
        {"Delta", CimValue::makeSigned(CMPI_sint8, -3)},
        {"Ratio", CimValue::makeReal(CMPI_real64, 2.5)},
        {"Flag", CimValue::makeBoolean(false)},
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
              "    Count = 42;\n"
              "    Delta = -3;\n"
              "    Ratio = 2.5;\n"
              "    Flag = FALSE;\n"
              "    Letter = '\\'';\n"
              "    When = \"19700101000000.000000+000\";\n"
              "    Other = \"root/cimv2:TST_Other.Name=\\\"o\\\\\\\\\\\"\";\n"
              "    Inner = \"root/cimv2:TST_Inner.Name=\\\"in\\\"\";\n"
              "    Tags = {\"a\\t\", NULL, \"\\x0001f\"};\n"
              "    Empty = {};\n"
              "    NoArray = NULL;\n"
              "};\n");
}

TEST(MofInstanceText, InstanceWithoutProperties) {
    Instance instance;
    instance.path.className = "TST_Bare";
    EXPECT_EQ(formatInstanceMof(instance), "// TST_Bare\ninstance of TST_Bare\n{\n};\n");
}

}  // namespace
}  // namespace tvxbroker
