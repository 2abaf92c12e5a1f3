// What the consistency suite counts as the same name, and which ends of an
// association it walks: a mistake in either would let real differences pass
// unseen, where most other mistakes fail the suite itself.
#include <gtest/gtest.h>

#include "ClientView.h"

namespace {

using namespace consistency;

class ClientViewTest : public testing::Test {
protected:
    ClientViewTest() {
        schema.loadText(R"(
class Test_Base { [Key] string Name; };
class Test_Pair : Test_Base { [Key] uint32 Number; };
[Association] class Test_Link { [Key] Test_Base REF Left; [Key] Test_Pair REF Right; };
[Association] class Test_NamedLink : Test_Link { Test_Pair REF Right; string Note; };
)",
                        "test.mof");
    }

    ClassSchema schema;
};

ObjectPath pair(const std::string &nameSpace, const std::string &cls, const std::string &nameKey,
                const std::string &name, std::uint64_t number = 7) {
    return ObjectPath{"", nameSpace, cls,
                      {{nameKey, CimValue::makeString(name)}, {"Number", CimValue::makeUnsigned(CMPI_uint32, number)}}};
}

TEST_F(ClientViewTest, SpellingKeyOrderAndHostDoNotMatterValuesDo) {
    const ObjectPath reference = pair("root/cimv2", "Test_Pair", "Name", "a");
    ObjectPath respelled = pair("ROOT/cimv2", "test_pair", "NAME", "a");
    std::swap(respelled.keys[0], respelled.keys[1]);
    respelled.host = "elsewhere";
    const std::pair<ObjectPath, bool> cases[] = {
        {respelled, true},
        {pair("root/cimv2", "Test_Pair", "Name", "A"), false},
        {pair("root/cimv2", "Test_Pair", "Name", "a", 8), false},
        {pair("root/other", "Test_Pair", "Name", "a"), false},
        {pair("root/cimv2", "Test_Base", "Name", "a"), false},
    };
    for (const auto &[path, same] : cases) {
        EXPECT_EQ(canonicalText(path, schema) == canonicalText(reference, schema), same) << formatPath(path);
    }
    const ObjectPath link{"", "root/cimv2", "Test_Link",
                          {{"right", CimValue::makeReference(respelled)}, {"Left", CimValue::makeReference(reference)}}};
    EXPECT_EQ(canonicalText(link, schema), R"(root/cimv2:Test_Link.Left="root/cimv2:Test_Pair.Name=\"a\",Number=7",)"
                                           R"(Right="root/cimv2:Test_Pair.Name=\"a\",Number=7")");
}

TEST_F(ClientViewTest, RolesIncludeInheritedReferencesOnce) {
    const std::vector<PropertyDecl> roles = rolesOf("Test_NamedLink", schema);
    ASSERT_EQ(roles.size(), 2U);
    EXPECT_EQ(roles[0].name, "Right");
    EXPECT_EQ(roles[0].referenceClass, "Test_Pair");
    EXPECT_EQ(roles[1].name, "Left");
}

}  // namespace
