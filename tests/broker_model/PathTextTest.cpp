#include <gtest/gtest.h>

#include <string>

#include "ErrorText.h"
#include "model/PathText.h"

namespace tvxbroker {
namespace {

const char *const pathMof = R"MOF(
class TST_Other { [Key] string K; };
class TST_Thing {
    [Key] string Name;
    [Key] uint8 Small;
    [Key] sint16 Delta;
    [Key] uint64 Big;
    [Key] sint64 Wide;
    [Key] boolean Flag;
    [Key] real64 Ratio;
    [Key] datetime When;
    [Key] char16 Letter;
    [Key] TST_Other REF Other;
};
class TST_Sub : TST_Thing { };
)MOF";

class PathTextTest : public ::testing::Test {
protected:
    void SetUp() override { schema.loadText(pathMof, "path.mof"); }
    ClassSchema schema;
};

TEST_F(PathTextTest, CanonicalTextRoundTrips) {
    const std::string cases[] = {
        "root/cimv2:TST_Other.K=\"say \\\"hi\\\" C:\\\\dir,x=1\"",
        "root/cimv2:TST_Thing.Small=255,Delta=-32768,Big=18446744073709551615,Wide=-9223372036854775808",
        "root/cimv2:TST_Thing.Flag=FALSE,Ratio=0.1,Name=\"a\"",
        "root/cimv2:TST_Thing.When=\"20240101120000.000000+000\",Letter=\"\xC3\xA9\"",
        "root/cimv2:TST_Sub.Other=\"root/interop:TST_Other.K=\\\"v \\\\\\\"q\\\\\\\"\\\"\",Name=NULL",
    };
    for (const std::string &text : cases) EXPECT_EQ(formatPath(parsePath(text, schema)), text);
}

TEST_F(PathTextTest, ValuesTakeTheDeclaredType) {
    const ObjectPath path = parsePath(
        "ns:tst_sub.small=7,FLAG=true,other=\"root/cimv2:TST_Other.K=\\\"v\\\"\",When=\"20240101130000.000000+060\"",
        schema);
    const ObjectPath other{"", "root/cimv2", "TST_Other", {{"K", CimValue::makeString("v")}}};
    const DateTime noonUtc{19723ull * 86400 * 1000000 + 12ull * 3600 * 1000000, false};
    EXPECT_EQ(path, (ObjectPath{"", "ns", "TST_Sub",
                                {{"Small", CimValue::makeUnsigned(CMPI_uint8, 7)},
                                 {"Flag", CimValue::makeBoolean(true)},
                                 {"Other", CimValue::makeReference(other)},
                                 {"When", CimValue::makeDateTime(noonUtc)}}}));
}

TEST_F(PathTextTest, ErrorsNameProblemAndPosition) {
    const std::pair<std::string, std::string> cases[] = {
        {"ns:TST_Other.K=\"x", "unterminated quoted value at position 15"},
        {"ns:TST_Thing.Small=256", "value 256 of Small is out of range for uint8 at position 19"},
        // Garbage that must end in an error, not a read past the end.
        {std::string("ns:TST_Other.K=\"\0\"", 18) + std::string(1, '\xff'),
         "unexpected character '\xFF' at position 18"},
        {"ns:TST_Thing.Other=\"ns:TST_Thing.Other=\\\"ns:TST_Thing.Other=\\\\\\\"\\\"\"",
         "invalid reference in Other (invalid reference in Other (unterminated quoted value at position 19) "
         "at position 19) at position 19"},
    };
    for (const auto &c : cases) {
        EXPECT_EQ(errorOf<PathParseError>([&] { parsePath(c.first, schema); }), c.second) << c.first;
    }
}

}  // namespace
}  // namespace tvxbroker
