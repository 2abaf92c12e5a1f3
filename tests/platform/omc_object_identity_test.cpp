// When a traversal takes a reference for its source object: the rules that
// let a provider rebuild the source path instead of copying it.
#include <gtest/gtest.h>

#include <utility>
#include <vector>

#include "CmpiBroker.h"
#include "core/Broker.h"
#include "platform/OmcObjectIdentity.h"

namespace {

using Keys = std::vector<std::pair<const char *, CmpiData>>;

CmpiObjectPath path(const char *ns, const char *className, const Keys &keys) {
    CmpiObjectPath result(ns, className);
    for (const auto &[name, value] : keys) result.setKey(name, value);
    return result;
}

CmpiObjectPath system(const Keys &keys) { return path(nullptr, "Test_System", keys); }

TEST(OmcObjectIdentity, PathsNameTheSameObjectByClassAndKeyValues) {
    // The broker knows the class hierarchy; the binding creates its objects through it.
    tvxbroker::Broker broker{tvxbroker::loadBrokerConfig({TVX_OMCTESTPROVIDER_DIR}, {TVX_OMCTESTPROVIDER_REG},
                                                         {TVX_OMCTESTPROVIDER_MOF})};
    const CmpiBroker binding{broker.cmpiBroker()};
    const CmpiObjectPath alpha = system({{"Name", "alpha"}});
    const CmpiObjectPath alphaInNamespace = path("root/cimv2", "Test_System", {{"Name", "alpha"}});
    const CmpiData nullText(static_cast<const char *>(nullptr));
    const auto link = [](const CmpiObjectPath &target) { return path(nullptr, "Test_Link", {{"Ref", target}}); };
    struct Case {
        const char *what;
        CmpiObjectPath a;
        CmpiObjectPath b;
        bool same;
    };
    // Each case is compared both ways round, so a subclass is also its superclass's case.
    const Case cases[] = {
        {"namespace ignored", alphaInNamespace, alpha, true},
        {"class and key names in any case", path(nullptr, "TEST_SYSTEM", {{"name", "alpha"}}), alpha, true},
        {"subclass", path(nullptr, "Test_Disk", {{"DeviceID", "d"}}), path(nullptr, "Test_Device", {{"DeviceID", "d"}}),
         true},
        {"unrelated class", path(nullptr, "Test_Device", {{"Name", "alpha"}}), alpha, false},
        {"class unknown to the broker", path(nullptr, "Nowhere", {{"Name", "alpha"}}), alpha, false},
        {"text differs in case", system({{"Name", "Alpha"}}), alpha, false},
        {"extra key", system({{"Name", "alpha"}, {"Rack", "1"}}), alpha, false},
        {"null keys", system({{"Name", nullText}}), system({{"Name", nullText}}), true},
        {"null and text", system({{"Name", nullText}}), alpha, false},
        {"references to one object", link(alpha), link(alphaInNamespace), true},
    };
    for (const Case &c : cases) {
        SCOPED_TRACE(c.what);
        EXPECT_EQ(OMC::sameObject(c.a, c.b), c.same);
        EXPECT_EQ(OMC::sameObject(c.b, c.a), c.same);
    }
}

}  // namespace
