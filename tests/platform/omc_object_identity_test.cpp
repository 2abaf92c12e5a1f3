// When a traversal takes a reference for its source object: the rules that
// let a provider rebuild the source path instead of copying it.
#include <gtest/gtest.h>

#include <cstdint>
#include <utility>
#include <vector>

#include "CmpiBroker.h"
#include "CmpiDateTime.h"
#include "OmcTestBroker.h"
#include "platform/OmcObjectIdentity.h"

namespace {

using Keys = std::vector<std::pair<const char *, CmpiData>>;

CmpiObjectPath path(const char *ns, const char *className, const Keys &keys) {
    CmpiObjectPath result(ns, className);
    for (const auto &[name, value] : keys) result.setKey(name, value);
    return result;
}

class OmcObjectIdentity : public testing::Test {
protected:
    tvxbroker::Broker broker{omctest::omcTestConfig()};
    CmpiBroker binding{broker.cmpiBroker()};  // the binding creates its objects through it
};

TEST_F(OmcObjectIdentity, PathsNameTheSameObjectByClassAndKeyValues) {
    const CmpiObjectPath alpha = path(nullptr, "Test_System", {{"Name", "alpha"}});
    const CmpiData nullText(static_cast<const char *>(nullptr));
    struct Case {
        const char *what;
        CmpiObjectPath a;
        CmpiObjectPath b;
        bool same;
    };
    const Case cases[] = {
        {"namespace ignored", path("root/cimv2", "Test_System", {{"Name", "alpha"}}), alpha, true},
        {"class name case ignored", path(nullptr, "TEST_SYSTEM", {{"name", "alpha"}}), alpha, true},
        {"subclass", path(nullptr, "Test_Disk", {{"DeviceID", "d"}}),
         path(nullptr, "Test_Device", {{"DeviceID", "d"}}), true},
        {"superclass", path(nullptr, "Test_Device", {{"DeviceID", "d"}}),
         path(nullptr, "Test_Disk", {{"DeviceID", "d"}}), true},
        {"unrelated class", path(nullptr, "Test_Device", {{"Name", "alpha"}}), alpha, false},
        {"class unknown to the broker", path(nullptr, "Nowhere", {{"Name", "alpha"}}), alpha, false},
        {"text differs in case", path(nullptr, "Test_System", {{"Name", "Alpha"}}), alpha, false},
        {"extra key", path(nullptr, "Test_System", {{"Name", "alpha"}, {"Rack", "1"}}), alpha, false},
        {"other key name", path(nullptr, "Test_System", {{"Label", "alpha"}}), alpha, false},
        {"integer widths", path(nullptr, "Test_System", {{"Id", CMPIUint16(7)}}),
         path(nullptr, "Test_System", {{"Id", CMPIUint64(7)}}), true},
        {"negative integer widths", path(nullptr, "Test_System", {{"Id", CMPISint8(-5)}}),
         path(nullptr, "Test_System", {{"Id", CMPISint64(-5)}}), true},
        {"all bits set, signed and unsigned", path(nullptr, "Test_System", {{"Id", CMPISint64(-1)}}),
         path(nullptr, "Test_System", {{"Id", CMPIUint64(UINT64_MAX)}}), false},
        {"integer and its text", path(nullptr, "Test_System", {{"Id", CMPIUint32(7)}}),
         path(nullptr, "Test_System", {{"Id", "7"}}), false},
        {"booleans", path(nullptr, "Test_System", {{"On", true}}),
         path(nullptr, "Test_System", {{"On", true}}), true},
        {"datetimes", path(nullptr, "Test_System", {{"At", CmpiDateTime(5, false)}}),
         path(nullptr, "Test_System", {{"At", CmpiDateTime(5, true)}}), false},
        {"null keys", path(nullptr, "Test_System", {{"Name", nullText}}),
         path(nullptr, "Test_System", {{"Name", nullText}}), true},
        {"null and text", path(nullptr, "Test_System", {{"Name", nullText}}), alpha, false},
        {"references to one object", path(nullptr, "Test_Link", {{"Ref", alpha}}),
         path(nullptr, "Test_Link", {{"Ref", path("root/cimv2", "Test_System", {{"Name", "alpha"}})}}),
         true},
        {"references to two objects", path(nullptr, "Test_Link", {{"Ref", alpha}}),
         path(nullptr, "Test_Link", {{"Ref", path(nullptr, "Test_System", {{"Name", "beta"}})}}),
         false},
    };
    for (const Case &c : cases) {
        SCOPED_TRACE(c.what);
        EXPECT_EQ(OMC::sameObject(c.a, c.b), c.same);
        EXPECT_EQ(OMC::sameObject(c.b, c.a), c.same);
    }
}

}  // namespace
