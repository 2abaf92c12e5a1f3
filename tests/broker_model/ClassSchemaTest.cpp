#include <gtest/gtest.h>

#include <cstdio>
#include <fstream>
#include <stdexcept>
#include <string>
#include <vector>

#include "ErrorText.h"
#include "model/ClassSchema.h"

namespace tvxbroker {
namespace {

// Real MOF files load in every broker test; here what they may vary in.
const char *const sampleMof = R"MOF(#pragma locale ("en_US")
// A comment with "quotes" and [brackets]
/* a block comment
   class NotAClass { }; */
Qualifier Key : boolean = false, Scope(property, reference), Flavor(DisableOverride, ToSubclass);

[Abstract, Description ("The root. \"Quoted\" ] text, "
    "concatenated; with { braces } and // no comment")]
class TST_Base {
    [Key, MaxLen (256)] string InstanceID;
    string Caption = "default; value";
    uint16 Codes[] = {1, 2, 3};
    [Key (false)] boolean NotKey;
    uint32 Reset([IN] boolean Force, [IN, OUT] string Messages[], [OUT] TST_Base REF Result);
};

[Association]
class TST_Link {
    [Key] TST_Base REF Antecedent;
    [Key] TST_Base REF Dependent;
};

class TST_Derived : tst_base {
    string InstanceID;
    [Key] sint64 Serial;
    uint8 Bytes[4];
};

instance of TST_Base as $base {
    InstanceID = "a}b;c";
    Codes = {4, 5};
};
)MOF";

class ClassSchemaTest : public ::testing::Test {
protected:
    void SetUp() override { schema.loadText(sampleMof, "sample.mof"); }
    ClassSchema schema;
};

TEST_F(ClassSchemaTest, RecordsPropertiesDefaultsAndKeysBaseFirst) {
    ASSERT_NE(schema.find("tst_BASE"), nullptr);
    EXPECT_EQ(schema.find("tst_BASE")->properties.size(), 4u) << "the method is not a property";
    EXPECT_EQ(schema.find("TST_Derived")->superclass, "TST_Base");
    struct Expected {
        const char *cls, *prop;
        CMPIType type;
        const char *referenceClass;
        bool key;
        CimValue defaultValue{};  // null unless the MOF gives one
    };
    const auto code = [](unsigned value) { return CimValue::makeUnsigned(CMPI_uint16, value); };
    const Expected expected[] = {
        {"TST_Base", "Codes", CMPI_uint16A, "", false, CimValue::makeArray(CMPI_uint16, {code(1), code(2), code(3)})},
        {"TST_Base", "NotKey", CMPI_boolean, "", false},
        {"TST_Link", "Dependent", CMPI_ref, "TST_Base", true},
        {"TST_Derived", "Bytes", CMPI_uint8A, "", false},
        {"TST_Derived", "caption", CMPI_string, "", false, CimValue::makeString("default; value")},
    };
    for (const Expected &e : expected) {
        const PropertyDecl *p = schema.findProperty(e.cls, e.prop);
        ASSERT_NE(p, nullptr) << e.cls << "." << e.prop;
        EXPECT_EQ(p->type, e.type) << e.prop;
        EXPECT_EQ(p->referenceClass, e.referenceClass) << e.prop;
        EXPECT_EQ(p->key, e.key) << e.prop;
        EXPECT_EQ(p->defaultValue, e.defaultValue) << e.prop;
    }
    const std::vector<PropertyDecl> keys = schema.keysOf("TST_Derived");
    ASSERT_EQ(keys.size(), 2u);
    EXPECT_EQ(keys[0].name, "InstanceID") << "redeclared without Key, still a key";
    EXPECT_EQ(keys[1].name, "Serial");
}

TEST_F(ClassSchemaTest, LoadsAccumulateAndFailedLoadsLeaveNothing) {
    schema.loadText("", "empty.mof");
    schema.loadText("\xEF\xBB\xBF// only a comment\n#pragma namespace(\"root/cimv2\")\n", "bom.mof");
    schema.loadText("[Indication] class TST_Event { };", "event.mof");
    schema.loadText("class TST_Alert : TST_Event { };", "alert.mof");
    EXPECT_TRUE(schema.isIndication("tst_alert"));
    EXPECT_THROW(schema.loadText("class TST_A {}; class TST_B : TST_Missing {};", "bad.mof"), std::runtime_error);
    EXPECT_EQ(schema.find("TST_A"), nullptr);
    schema.loadText("class TST_A {};", "again.mof");
    EXPECT_NE(schema.find("TST_A"), nullptr);
}

TEST(ClassSchemaErrors, NameOriginLineAndProblem) {
    const std::pair<std::string, std::string> cases[] = {
        {"class A {\n/* never closed", "t.mof:2: unterminated comment"},
        {"\n\nclass known { };", "t.mof:3: class known is already declared"},
        {std::string("class A {\0};", 12), "t.mof:1: unexpected byte 0x00"},
        {"class A {\n uint16 p = 65536; };", "t.mof:2: default value 65536 of p is out of range for uint16"},
    };
    for (const auto &c : cases) {
        ClassSchema schema;
        schema.loadText("class Known { };", "known.mof");
        EXPECT_EQ(errorOf([&] { schema.loadText(c.first, "t.mof"); }), c.second) << c.first;
    }
}

TEST(ClassSchemaErrors, FilesAreNamedInMessages) {
    ClassSchema schema;
    EXPECT_EQ(errorOf([&] { schema.loadFile("/"); }), "cannot read /");
    const std::string path = ::testing::TempDir() + "schema_test.mof";
    std::ofstream(path) << "class F {\n  uint99 x;\n};\n";
    EXPECT_EQ(errorOf([&] { schema.loadFile(path); }), path + ":2: unknown type 'uint99'");
    std::remove(path.c_str());
}

}  // namespace
}  // namespace tvxbroker
