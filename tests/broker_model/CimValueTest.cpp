#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "model/CimValue.h"

namespace tvxbroker {
namespace {

ObjectPath pathWithKey(const std::string &cls, const std::string &key, CimValue value) {
    ObjectPath path;
    path.nameSpace = "root/cimv2";
    path.className = cls;
    path.keys.push_back({key, std::move(value)});
    return path;
}

struct EqualityCase {
    const char *what;
    CimValue a;
    CimValue b;
    bool equal;
};

TEST(CimValue, EqualityComparesTypeNullnessAndSelectedMember) {
    CimValue staleMember = CimValue::makeUnsigned(CMPI_uint8, 1);
    staleMember.text = "ignored";
    Instance left;
    left.path = pathWithKey("A", "K", CimValue::makeString("x"));
    left.properties.push_back({"P", CimValue::makeSigned(CMPI_sint32, -1)});
    Instance right = left;
    right.properties[0].name = "p";
    Instance different = left;
    different.properties[0].value = CimValue::makeSigned(CMPI_sint32, -2);

    const std::vector<EqualityCase> cases = {
        {"same string", CimValue::makeString("a"), CimValue::makeString("a"), true},
        {"string case matters", CimValue::makeString("a"), CimValue::makeString("A"), false},
        {"type differs", CimValue::makeUnsigned(CMPI_uint8, 1), CimValue::makeUnsigned(CMPI_uint16, 1), false},
        {"null differs", CimValue::makeNull(CMPI_string), CimValue::makeString(""), false},
        {"nulls of one type", CimValue::makeNull(CMPI_uint8), CimValue::makeNull(CMPI_uint8), true},
        {"unselected member ignored", staleMember, CimValue::makeUnsigned(CMPI_uint8, 1), true},
        {"signed", CimValue::makeSigned(CMPI_sint64, -5), CimValue::makeSigned(CMPI_sint64, 5), false},
        {"real", CimValue::makeReal(CMPI_real64, 1.5), CimValue::makeReal(CMPI_real64, 1.5), true},
        {"datetime kind", CimValue::makeDateTime({5, false}), CimValue::makeDateTime({5, true}), false},
        {"array elements", CimValue::makeArray(CMPI_uint8, {CimValue::makeUnsigned(CMPI_uint8, 1)}),
         CimValue::makeArray(CMPI_uint8, {CimValue::makeUnsigned(CMPI_uint8, 2)}), false},
        {"array length", CimValue::makeArray(CMPI_uint8, {}),
         CimValue::makeArray(CMPI_uint8, {CimValue::makeUnsigned(CMPI_uint8, 1)}), false},
        {"reference names ignore case",
         CimValue::makeReference(pathWithKey("Cls", "Key", CimValue::makeString("v"))),
         CimValue::makeReference(pathWithKey("CLS", "kEY", CimValue::makeString("v"))), true},
        {"reference key value", CimValue::makeReference(pathWithKey("C", "K", CimValue::makeString("v"))),
         CimValue::makeReference(pathWithKey("C", "K", CimValue::makeString("w"))), false},
        {"embedded instance", CimValue::makeInstance(left), CimValue::makeInstance(right), true},
        {"embedded instance property", CimValue::makeInstance(left), CimValue::makeInstance(different), false},
    };
    for (const EqualityCase &c : cases) {
        EXPECT_EQ(c.a == c.b, c.equal) << c.what;
        EXPECT_EQ(c.b == c.a, c.equal) << c.what;
    }
}

TEST(CimValue, PathEqualityIgnoresKeyOrderButNotDuplicates) {
    ObjectPath a = pathWithKey("C", "K1", CimValue::makeString("x"));
    a.keys.push_back({"K2", CimValue::makeBoolean(true)});
    ObjectPath b = pathWithKey("C", "K2", CimValue::makeBoolean(true));
    b.keys.push_back({"K1", CimValue::makeString("x")});
    EXPECT_EQ(a, b);

    ObjectPath twice = pathWithKey("C", "K1", CimValue::makeString("x"));
    twice.keys.push_back({"k1", CimValue::makeString("x")});
    EXPECT_NE(a, twice);
    EXPECT_NE(twice, a);
}

TEST(CimValue, LookupIgnoresCase) {
    Instance instance;
    instance.path = pathWithKey("C", "Name", CimValue::makeString("n"));
    instance.properties.push_back({"Size", CimValue::makeUnsigned(CMPI_uint32, 7)});
    ASSERT_NE(instance.path.key("NAME"), nullptr);
    EXPECT_EQ(instance.path.key("name")->text, "n");
    ASSERT_NE(instance.property("sIZE"), nullptr);
    EXPECT_EQ(instance.property("size")->unsignedValue, 7u);
    EXPECT_EQ(instance.property("Name"), nullptr);
    EXPECT_EQ(instance.path.key(""), nullptr);
}

TEST(CimValue, NameHelpers) {
    EXPECT_TRUE(equalsIgnoreCase("CIM_System", "cim_SYSTEM"));
    EXPECT_FALSE(equalsIgnoreCase("abc", "abd"));
    EXPECT_FALSE(equalsIgnoreCase("abc", "ab"));
    EXPECT_FALSE(equalsIgnoreCase("\xC3\xA9", "\xC3\x89"));  // only ASCII folds
    EXPECT_EQ(toLowerAscii("AbC_9"), "abc_9");
    EXPECT_TRUE(isCimName("_a1"));
    EXPECT_FALSE(isCimName("1a"));
    EXPECT_FALSE(isCimName(""));
    EXPECT_FALSE(isCimName("a-b"));
}

}  // namespace
}  // namespace tvxbroker
