// What the consistency suite counts as the same name: a mistake here would
// let real differences pass or report ones a client would never see.
#include <gtest/gtest.h>

#include "ClientView.h"
#include "model/PathText.h"

namespace {

using namespace tvxbroker;
using consistency::canonicalText;

const char *const kMof = R"(
class Test_Base { [Key] string Name; };
class Test_Pair : Test_Base { [Key] uint32 Number; string Label; };
[Association] class Test_Link { [Key] Test_Base REF Left; [Key] Test_Pair REF Right; };
[Association] class Test_NamedLink : Test_Link { Test_Pair REF Right; string Note; };
)";

ClassSchema schema() {
    ClassSchema loaded;
    loaded.loadText(kMof, "test.mof");
    return loaded;
}

ObjectPath pair(const std::string &nameSpace, const std::string &cls, const std::string &nameKey,
                const std::string &name, const CimValue &number) {
    return ObjectPath{"", nameSpace, cls, {{nameKey, CimValue::makeString(name)}, {"Number", number}}};
}

const CimValue kSeven = CimValue::makeUnsigned(CMPI_uint32, 7);

TEST(ClientViewTest, SpellingKeyOrderAndHostDoNotMatter) {
    ObjectPath reordered = pair("ROOT/cimv2", "test_pair", "NAME", "a", kSeven);
    std::swap(reordered.keys[0], reordered.keys[1]);
    reordered.host = "elsewhere";
    const ObjectPath link{"", "root/cimv2", "Test_Link",
                          {{"right", CimValue::makeReference(reordered)},
                           {"Left", CimValue::makeReference(pair("root/cimv2", "Test_Pair", "Name", "a", kSeven))}}};
    EXPECT_EQ(canonicalText(reordered, schema()), canonicalText(pair("root/cimv2", "Test_Pair", "Name", "a", kSeven), schema()));
    EXPECT_EQ(canonicalText(link, schema()),
              R"(root/cimv2:Test_Link.Left="root/cimv2:Test_Pair.Name=\"a\",Number=7",)"
              R"(Right="root/cimv2:Test_Pair.Name=\"a\",Number=7")");
}

TEST(ClientViewTest, ValuesDoMatter) {
    const ObjectPath reference = pair("root/cimv2", "Test_Pair", "Name", "a", kSeven);
    for (const ObjectPath &other : {pair("root/cimv2", "Test_Pair", "Name", "A", kSeven),
                                    pair("root/cimv2", "Test_Pair", "Name", "a", CimValue::makeUnsigned(CMPI_uint32, 8)),
                                    pair("root/other", "Test_Pair", "Name", "a", kSeven),
                                    pair("root/cimv2", "Test_Base", "Name", "a", kSeven)}) {
        EXPECT_NE(canonicalText(other, schema()), canonicalText(reference, schema())) << formatPath(other);
    }
}

TEST(ClientViewTest, NameTakesTheDeclaredKeysIncludingInheritedOnes) {
    const Instance full{ObjectPath{"", "root/cimv2", "Test_Pair", {}},
                        {{"Label", CimValue::makeString("x")}, {"Number", kSeven}, {"name", CimValue::makeString("a")}}};
    EXPECT_EQ(canonicalText(consistency::nameOf(full, schema()), schema()),
              R"(root/cimv2:Test_Pair.Name="a",Number=7)");
    const Instance lacking{full.path, {{"Number", kSeven}}};
    EXPECT_EQ(consistency::nameOf(lacking, schema()).keys.size(), 1U);
}

TEST(ClientViewTest, RolesIncludeInheritedReferencesOnce) {
    const std::vector<consistency::Role> roles = consistency::rolesOf("Test_NamedLink", schema());
    ASSERT_EQ(roles.size(), 2U);
    EXPECT_EQ(roles[0].name, "Right");
    EXPECT_EQ(roles[0].referenceClass, "Test_Pair");
    EXPECT_EQ(roles[1].name, "Left");
}

}  // namespace
