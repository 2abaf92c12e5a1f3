#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "model/CimValue.h"

namespace tvxbroker {
namespace {

ObjectPath pathWithKey(const std::string &cls, const std::string &key, CimValue value) {
    return ObjectPath{"", "root/cimv2", cls, {{key, std::move(value)}}};
}

struct EqualityCase {
    const char *what;
    CimValue a;
    CimValue b;
    bool equal;
};

// Values and the paths inside references and instances, compared both ways.
TEST(CimValue, EqualityComparesTypeNullnessAndSelectedMember) {
    CimValue staleMember = CimValue::makeUnsigned(CMPI_uint8, 1);
    staleMember.text = "ignored";
    const Instance left{pathWithKey("A", "K", CimValue::makeString("x")),
                        {{"P", CimValue::makeSigned(CMPI_sint32, -1)}}};
    Instance right = left;
    right.properties[0].name = "p";
    const CimValue x = CimValue::makeString("x");
    const CimValue yes = CimValue::makeBoolean(true);
    const ObjectPath twoKeys{"", "root/cimv2", "C", {{"K1", x}, {"K2", yes}}};
    const ObjectPath keysReordered{"", "root/cimv2", "C", {{"K2", yes}, {"K1", x}}};
    const ObjectPath keyTwice{"", "root/cimv2", "C", {{"K1", x}, {"k1", x}}};

    const std::vector<EqualityCase> cases = {
        {"type differs", CimValue::makeUnsigned(CMPI_uint8, 1), CimValue::makeUnsigned(CMPI_uint16, 1), false},
        {"null differs", CimValue::makeNull(CMPI_string), CimValue::makeString(""), false},
        {"unselected member ignored", staleMember, CimValue::makeUnsigned(CMPI_uint8, 1), true},
        {"reference names ignore case",
         CimValue::makeReference(pathWithKey("Cls", "Key", CimValue::makeString("v"))),
         CimValue::makeReference(pathWithKey("CLS", "kEY", CimValue::makeString("v"))), true},
        {"reference key order ignored", CimValue::makeReference(twoKeys), CimValue::makeReference(keysReordered),
         true},
        {"reference duplicate key", CimValue::makeReference(twoKeys), CimValue::makeReference(keyTwice), false},
        {"embedded instance", CimValue::makeInstance(left), CimValue::makeInstance(right), true},
    };
    for (const EqualityCase &c : cases) {
        EXPECT_EQ(c.a == c.b, c.equal) << c.what;
        EXPECT_EQ(c.b == c.a, c.equal) << c.what;
    }
    EXPECT_FALSE(equalsIgnoreCase("abc", "ab"));
    EXPECT_FALSE(equalsIgnoreCase("\xC3\xA9", "\xC3\x89")) << "only ASCII folds";
}

}  // namespace
}  // namespace tvxbroker
