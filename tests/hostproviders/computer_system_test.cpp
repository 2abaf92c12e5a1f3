// OMC_UnitaryComputerSystem through the embedded broker: the one system,
// named as the product names the host in its own paths, and NOT_FOUND for
// every other path, to a client and to a provider's up-call alike (an
// up-call answered OK without an instance kills sfcb's provider process).
#include "UpCall.h"

namespace {

using namespace producttest;

constexpr const char *kClass = "OMC_UnitaryComputerSystem";
constexpr const char *kUnserved = "Test_UnservedComputerSystem";

class ComputerSystemProvider : public ProductBroker {
protected:
    ComputerSystemProvider() : ProductBroker(kClass, kUnserved) {}

    ObjectPath systemPath(const std::string &cls, const CimValue &creationClassName, const CimValue &name) const {
        return ObjectPath{"", kNs, cls, {{"CreationClassName", creationClassName}, {"Name", name}}};
    }
};

// The keys every product device carries name this one instance.
TEST_F(ComputerSystemProvider, ServesTheOneSystemThatTheProductsPathsName) {
    const Response names = broker->enumInstanceNames(classPath(kClass));
    ASSERT_TRUE(names.ok());
    ASSERT_EQ(names.paths.size(), 1u);
    EXPECT_EQ(names.paths[0].key("Name")->text, hostName);
    const Response processors = broker->enumInstances(classPath("Talvex_Processor"), {});
    ASSERT_TRUE(processors.ok());
    ASSERT_FALSE(processors.instances.empty());
    const Instance &device = processors.instances[0];
    const Response system = broker->getInstance(
        systemPath(kClass, *device.property("SystemCreationClassName"), *device.property("SystemName")), {});
    ASSERT_TRUE(system.ok()) << system.rc;
    EXPECT_EQ(pathTexts(system), pathTexts(names));
    EXPECT_EQ(upCallStatus(*broker, names.paths[0]), CMPI_RC_OK);
}

TEST_F(ComputerSystemProvider, EveryOtherPathIsNotFoundToClientsAndUpCalls) {
    const CimValue systemClass = CimValue::makeString(kClass);
    const CimValue host = CimValue::makeString(hostName);
    const struct {
        const char *what;
        ObjectPath path;
    } cases[] = {
        {"another host name", systemPath(kClass, systemClass, CimValue::makeString(hostName + "x"))},
        {"another creation class", systemPath(kClass, CimValue::makeString("CIM_ComputerSystem"), host)},
        {"no name", ObjectPath{"", kNs, kClass, {{"CreationClassName", systemClass}}}},
        {"another class", systemPath(kUnserved, systemClass, host)},
    };
    for (const auto &c : cases) {
        const Response response = broker->getInstance(c.path, {});
        EXPECT_EQ(response.rc, CMPI_RC_ERR_NOT_FOUND) << c.what;
        EXPECT_TRUE(response.instances.empty()) << c.what;
        EXPECT_EQ(upCallStatus(*broker, c.path), CMPI_RC_ERR_NOT_FOUND) << c.what;
    }
    EXPECT_TRUE(broker->enumInstanceNames(classPath(kUnserved)).paths.empty());
}

}  // namespace
