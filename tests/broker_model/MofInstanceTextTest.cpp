#include <gtest/gtest.h>

#include <string>

#include "model/MofInstanceText.h"

namespace tvxbroker {
namespace {

ObjectPath pathOf(const std::string &cls, const std::string &key) {
    return ObjectPath{"", "root/cimv2", cls, {{"Name", CimValue::makeString(key)}}};
}

// Unsigned integers, booleans and string arrays show in tvxcim's output tests.
TEST(MofInstanceText, EscapesTextsAndWritesNullsRealsReferencesAndArrays) {
    Instance instance;
    instance.path = pathOf("TST_Thing", "line1\nline2 \"q\"");
    instance.properties = {
        {"Name", CimValue::makeString("line1\nline2 \"q\"")},
        {"Missing", CimValue::makeNull(CMPI_string)},
        {"Ratio", CimValue::makeReal(CMPI_real64, 2.5)},
        {"Letter", CimValue::makeUnsigned(CMPI_char16, '\'')},
        {"Other", CimValue::makeReference(pathOf("TST_Other", "o\\"))},
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
              "    Ratio = 2.5;\n"
              "    Letter = '\\'';\n"
              "    Other = \"root/cimv2:TST_Other.Name=\\\"o\\\\\\\\\\\"\";\n"
              "    Tags = {\"a\\t\", NULL, \"\\x0001f\"};\n"
              "    Empty = {};\n"
              "    NoArray = NULL;\n"
              "};\n");
}

}  // namespace
}  // namespace tvxbroker
