// Talvex_InstalledSoftwareIdentity through the embedded broker and the
// shipped library, as far as the association's instance side goes: the
// software side comes from the software identity provider by up-calls, and
// the alternate boot bank's image is never installed software.
#include <algorithm>

#include "ProductBroker.h"
#include "SoftwareTesting.h"

namespace {

using namespace producttest;
using softwaretest::kAltId;
using softwaretest::kRunningId;

constexpr const char *kClass = "Talvex_InstalledSoftwareIdentity";
constexpr const char *kUnserved = "Test_UnservedInstalledSoftware";

ObjectPath softwarePath(const std::string &instanceId) {
    return ObjectPath{"", kNs, "Talvex_HypervisorSoftwareIdentity",
                      {{"InstanceID", CimValue::makeString(instanceId)}}};
}

const ObjectPath &referenceOf(const ObjectPath &association, const char *role) {
    const CimValue *value = association.key(role);
    EXPECT_TRUE(value != nullptr && value->reference) << role;
    static const ObjectPath none;
    return value != nullptr && value->reference ? *value->reference : none;
}

class InstalledSoftware : public ProductBroker {
protected:
    InstalledSoftware() : ProductBroker(kClass, kUnserved) {}

    void SetUp() override {
        ProductBroker::SetUp();
        serve(R"({"hostType": "Corlai"})");
    }

    ObjectPath systemPath() const {
        return ObjectPath{"", kNs, "OMC_UnitaryComputerSystem",
                          {{"Name", CimValue::makeString(hostName)},
                           {"CreationClassName", CimValue::makeString("OMC_UnitaryComputerSystem")}}};
    }

    ObjectPath associationPath(const std::string &instanceId, const char *cls = kClass) const {
        return ObjectPath{"", kNs, cls,
                          {{"System", CimValue::makeReference(systemPath())},
                           {"InstalledSoftware", CimValue::makeReference(softwarePath(instanceId))}}};
    }

    softwaretest::BootBankFile bootCfg{"build=5.1.0-654321\n"};
};

TEST_F(InstalledSoftware, OneNameForTheRunningImageOnly) {
    const Response names = broker->enumInstanceNames(classPath(kClass));
    ASSERT_TRUE(names.ok());
    ASSERT_EQ(names.paths.size(), 1u);
    EXPECT_TRUE(names.done);
    EXPECT_EQ(referenceOf(names.paths[0], "InstalledSoftware").key("InstanceID")->text, kRunningId);
    EXPECT_EQ(referenceOf(names.paths[0], "System").nameSpace, "/root/cimv2");
}

// The answer depends only on whether the software provider knows the
// image, so the alternate one is found here; an unknown one passes on the
// broker's NOT_FOUND.
TEST_F(InstalledSoftware, GetInstanceAsksTheSoftwareProvider) {
    const struct {
        std::string instanceId;
        const char *cls;
        CMPIrc rc;
    } cases[] = {
        {kRunningId, kClass, CMPI_RC_OK},
        {kAltId, kClass, CMPI_RC_OK},
        {"Talvex Corlai 5.1.0 build-1", kClass, CMPI_RC_ERR_NOT_FOUND},
        {kRunningId, kUnserved, CMPI_RC_ERR_NOT_FOUND},
    };
    for (const auto &c : cases) {
        const Response response = broker->getInstance(associationPath(c.instanceId, c.cls), {});
        EXPECT_EQ(response.rc, c.rc) << c.instanceId << " " << c.cls;
        ASSERT_EQ(response.instances.size(), c.rc == CMPI_RC_OK ? 1u : 0u);
        if (c.rc != CMPI_RC_OK) continue;
        const ObjectPath &path = response.instances[0].path;
        EXPECT_EQ(referenceOf(path, "InstalledSoftware").key("InstanceID")->text, c.instanceId);
        EXPECT_EQ(referenceOf(path, "System").nameSpace, "/root/cimv2");
    }
}

// Traversals reach the stand-in's real computer system and the software
// provider's real images; roles are compared without regard to case, and
// the alternate image is never installed software. Unfiltered traversals
// from both ends are the consistency suite's.
TEST_F(InstalledSoftware, TraversalsFromBothEnds) {
    const ObjectPath system = systemPath();
    const struct {
        ObjectPath from;
        const char *resultClass, *role, *resultRole;
        const char *found;  // class of the one associator; null: none
    } cases[] = {
        {system, "CIM_SoftwareIdentity", "system", "INSTALLEDSOFTWARE", "Talvex_HypervisorSoftwareIdentity"},
        {system, "CIM_LogicalDevice", "", "", nullptr},
        {system, "", "", "System", nullptr},
        {softwarePath(kRunningId), "CIM_ComputerSystem", "installedsoftware", "SYSTEM", "OMC_UnitaryComputerSystem"},
        {softwarePath(kRunningId), "", "System", "", nullptr},
        {softwarePath(kAltId), "", "", "", nullptr},
    };
    for (const auto &c : cases) {
        SCOPED_TRACE(formatPath(c.from) + " " + c.resultClass + " " + c.role + " " + c.resultRole);
        const Response associators = broker->associators(c.from, kClass, c.resultClass, c.role, c.resultRole, {});
        ASSERT_TRUE(associators.ok()) << associators.rc;
        ASSERT_EQ(associators.instances.size(), c.found ? 1u : 0u);
        const Response references = broker->references(c.from, kClass, c.role, {});
        ASSERT_TRUE(references.ok()) << references.rc;
        if (c.found == nullptr) continue;
        EXPECT_EQ(associators.instances[0].path.className, c.found);
        ASSERT_FALSE(references.instances.empty());
        EXPECT_EQ(referenceOf(references.instances[0].path, "InstalledSoftware").key("InstanceID")->text, kRunningId);
    }
}

// Without a software identity provider the up-call enumeration is empty,
// and then the association answers nothing at all, not even its end.
TEST(InstalledSoftwareAlone, NothingAndNoEndWithoutSoftware) {
    BrokerConfig config = loadBrokerConfig({TVX_PROVIDER_DIR}, {TVX_PROVIDER_REG}, {TVX_PRODUCT_MOFS, TVX_TEST_MOF});
    std::vector<ProviderRegistration> &registrations = config.registrations;
    registrations.erase(std::remove_if(registrations.begin(), registrations.end(),
                                       [](const ProviderRegistration &registration) {
                                           return registration.className == "Talvex_HypervisorSoftwareIdentity";
                                       }),
                        registrations.end());
    Broker broker(std::move(config));
    const Response names = broker.enumInstanceNames(ObjectPath{"", kNs, kClass, {}});
    EXPECT_TRUE(names.ok());
    EXPECT_TRUE(names.paths.empty());
    EXPECT_FALSE(names.done);
    EXPECT_EQ(broker.liveObjectCount(), 0u);
    broker.shutdown();
}

}  // namespace
