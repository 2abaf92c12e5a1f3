// The Ethernet port provider as a client sees it through the broker: its
// answers to requests it cannot serve, the values a formatting fault would
// change, the property filter, and ports and their driver and firmware
// identities followed in both directions with the filters a client can
// give. Lookups by the names it gives are the consistency suite's.
#include <gmock/gmock.h>

#include "ProductBroker.h"

namespace ethernettest {
namespace {

using namespace producttest;

constexpr const char *kPort = "Talvex_EthernetPort";
// Served by the Ethernet port provider in these tests only.
constexpr const char *kUnservedClass = "Test_UnservedPort";

class EthernetBroker : public ProductBroker {
protected:
    EthernetBroker() : ProductBroker(kPort, kUnservedClass) {}

    ObjectPath portPath(const std::string &deviceId) const {
        return ObjectPath{"", kNs, kPort,
                          {{"DeviceID", CimValue::makeString(deviceId)},
                           {"SystemCreationClassName", CimValue::makeString("OMC_UnitaryComputerSystem")},
                           {"SystemName", CimValue::makeString(hostName)},
                           {"CreationClassName", CimValue::makeString(kPort)}}};
    }

    static ObjectPath identityPath(const std::string &cls, const std::string &instanceId) {
        return ObjectPath{"", kNs, cls, {{"InstanceID", CimValue::makeString(instanceId)}}};
    }
};

// Two adapters: nic0 (link up, 10000 Mb/s, a firmware version wider than
// its record field) and nic1 (link down, a MAC text with a pair that cannot
// be read, filling its field with no terminator).
std::string twoAdapterProfile(const std::string &faults = "") {
    return R"({"hostType": "Corlai", "adapters": [
        {"name": "nic0", "driverName": "netdrv", "driverVersion": "1.2.3",
         "firmwareVersion": "fw-9.0.0-with-a-text-wider-than-its-field",
         "interfaceName": "vmk-nic0", "capabilities": "0x800", "enabledCapabilities": "0x0",
         "pciBus": 16, "pciSlot": 2, "pciFunction": 1, "pciVendorId": "0x15", "pciDeviceId": "0x10fb",
         "linkUp": true, "speedMbps": 10000, "fullDuplex": true, "mac": "02:1b:21:0a:0b:0c", "mtu": 9000},
        {"name": "nic1", "driverName": "tg3", "driverVersion": "3.1", "firmwareVersion": "bc 5",
         "linkUp": false, "mac": "d0:94:zz:1a:2b:3d:and-more-than-its-field", "mtu": 1500}
    ], "faults": [)" + faults + "]}";
}

// The code and message, and nothing returned before or after the error.
TEST_F(EthernetBroker, EveryFailureHasItsCodeAndMessage) {
    serve(twoAdapterProfile());
    const char *notValid = "DeviceID specified is not valid";
    const ObjectPath keyless = classPath(kPort);
    Broker &b = *broker;
    const struct {
        const char *what;
        Response response;
        CMPIrc rc;
        const char *message;  // null: none expected
    } cases[] = {
        {"ein unknown class", b.enumInstanceNames(classPath(kUnservedClass)), CMPI_RC_ERR_INVALID_CLASS, nullptr},
        {"gi unknown class", b.getInstance(classPath(kUnservedClass), std::nullopt), CMPI_RC_ERR_NOT_FOUND, notValid},
        {"gi port without DeviceID", b.getInstance(keyless, std::nullopt), CMPI_RC_ERR_NOT_FOUND,
         "Specified DeviceID is not found"},
        {"gi identity without InstanceID",
         b.getInstance(classPath("Talvex_EPFirmwareSoftwareIdentity"), std::nullopt), CMPI_RC_ERR_INVALID_PARAMETER,
         notValid},
        {"create", b.createInstance(portPath("nic0"), Instance{portPath("nic0"), {}}), CMPI_RC_ERR_NOT_SUPPORTED,
         nullptr},
        {"ri port without DeviceID", b.references(keyless, "", "Dependent", std::nullopt),
         CMPI_RC_ERR_INVALID_PARAMETER, notValid},
    };
    for (const auto &c : cases) {
        EXPECT_EQ(c.response.rc, c.rc) << c.what;
        EXPECT_EQ(c.response.message.value_or("<none>"), c.message ? c.message : "<none>") << c.what;
        EXPECT_TRUE(c.response.instances.empty() && c.response.paths.empty() && !c.response.done) << c.what;
    }
    // Without Dependent the key cannot be read at all: a clear error, not a crash.
    const Response noDependent = b.getInstance(classPath("Talvex_EPFirmwareElementSoftwareIdentity"), std::nullopt);
    EXPECT_NE(noDependent.rc, CMPI_RC_OK);
    EXPECT_TRUE(noDependent.instances.empty());
}

// The values whose text a formatting fault would change: the MACs, the speed
// in bit/s (beyond 32 bits), the PCI numbers ("0x%u" is decimal, "0x%4x"
// pads), the capability bit, the link state down, the firmware text cut to its
// record field (31 characters) before it is formatted, and the elements'
// status array.
TEST_F(EthernetBroker, ValuesAsClientsReadThem) {
    serve(twoAdapterProfile());
    const struct {
        const char *cls;
        std::size_t index;
        const char *property, *literal;
    } cases[] = {
        {kPort, 0, "PermanentAddress", "\"021B210A0B0C\""},
        {kPort, 0, "Speed", "10000000000"},
        {kPort, 0, "OtherIdentifyingInfo", "{\"vmk-nic0\", \"0x16\", \"0x2\", \"0x1\", \"0x  15\", \"0x10fb\"}"},
        {kPort, 0, "Capabilities", "{5}"},
        {kPort, 1, "OperationalStatus", "{10}"},
        {kPort, 1, "PermanentAddress", "\"D09400000000\""},
        {"Talvex_EPFirmwareSoftwareIdentity", 0, "VersionString",
         "\"netdrv device firmware fw-9.0.0-with-a-text-wider-than\""},
        {"Talvex_EPFirmwareElementSoftwareIdentity", 1, "ElementSoftwareStatus", "{2}"},
    };
    for (const auto &c : cases) {
        const Response response = broker->enumInstances(classPath(c.cls), std::nullopt);
        ASSERT_EQ(response.instances.size(), 2u) << c.cls << ": " << response.message.value_or("");
        EXPECT_EQ(literals(response.instances[c.index]).at(c.property), c.literal) << c.cls << " " << c.property;
    }
}

// The filter keeps out what the provider sets later; the class's defaults
// and the key of the provider's path are there before it, as in sfcb.
TEST_F(EthernetBroker, PropertyListFiltersPortsOnly) {
    serve(twoAdapterProfile());
    const PropertyList speedOnly = std::vector<std::string>{"Speed"};
    const Response ports = broker->enumInstances(classPath(kPort), speedOnly);
    ASSERT_EQ(ports.instances.size(), 2u);
    using testing::Key;
    EXPECT_THAT(literals(ports.instances[0]),
                testing::UnorderedElementsAre(Key("Speed"), Key("DeviceID"), Key("EnabledState"), Key("RequestedState"),
                                              Key("EnabledDefault"), Key("TransitioningToState")));
    const Response drivers = broker->enumInstances(classPath("Talvex_EPDriverSoftwareIdentity"), speedOnly);
    ASSERT_EQ(drivers.instances.size(), 2u);
    EXPECT_EQ(literals(drivers.instances[0]).size(), 4u);  // IsEntity is a class default
}

// The traversal works from the paths alone, so it answers even on a host
// whose inventory fails. Unfiltered traversals are the consistency suite's.
TEST_F(EthernetBroker, TraversalFromThePathsAloneWithEveryFilter) {
    serve(twoAdapterProfile(R"({"call": "PRB_CheckSig"})"));
    const std::string driverNic0 = formatPath(
        identityPath("Talvex_EPDriverSoftwareIdentity", "Talvex:Talvex_EPDriverSoftwareIdentity:nic0"));
    const std::string firmwareNic0 = formatPath(
        identityPath("Talvex_EPFirmwareSoftwareIdentity", "Talvex:Talvex_EPFirmwareSoftwareIdentity:nic0"));
    const ObjectPath port = portPath("nic0");
    const ObjectPath firmware =
        identityPath("Talvex_EPFirmwareSoftwareIdentity", "Talvex:Talvex_EPFirmwareSoftwareIdentity:nic3");
    const struct {
        const char *what;
        const ObjectPath &from;
        std::string assocClass, resultClass, role, resultRole;
        std::vector<std::string> found;
    } cases[] = {
        {"result class firmware", port, "", "Talvex_EPFirmwareSoftwareIdentity", "", "", {firmwareNic0}},
        {"role Dependent, any case", port, "", "", "dependent", "ANTECEDENT", {driverNic0, firmwareNic0}},
        {"role Antecedent", port, "", "", "Antecedent", "", {}},
        {"identity, result class base of the port", firmware, "", "CIM_NetworkPort", "Antecedent", "Dependent",
         {formatPath(portPath("nic3"))}},
    };
    for (const auto &c : cases) {
        const Response response = broker->associatorNames(c.from, c.assocClass, c.resultClass, c.role, c.resultRole);
        EXPECT_EQ(response.rc, CMPI_RC_OK) << c.what << ": " << response.message.value_or("");
        EXPECT_EQ(pathTexts(response), c.found) << c.what;
    }
}

}  // namespace
}  // namespace ethernettest
