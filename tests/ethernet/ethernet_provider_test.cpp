// The Ethernet port provider as a client sees it through the broker: its
// answers to requests it cannot serve, the values a formatting fault would
// change, the property filter, lookups by names other than its own, and
// ports and their driver and firmware identities followed in both
// directions with the filters a client can give.
#include <gmock/gmock.h>

#include "ProductBroker.h"

namespace ethernettest {
namespace {

using namespace producttest;

// Served by the Ethernet port provider in these tests only.
constexpr const char *kUnservedClass = "Test_UnservedPort";

class EthernetBroker : public ProductBroker {
protected:
    EthernetBroker() : ProductBroker("Talvex_EthernetPort", kUnservedClass) {}

    ObjectPath portPath(const std::string &deviceId) const {
        return ObjectPath{"", kNs, "Talvex_EthernetPort",
                          {{"DeviceID", CimValue::makeString(deviceId)},
                           {"SystemCreationClassName", CimValue::makeString("OMC_UnitaryComputerSystem")},
                           {"SystemName", CimValue::makeString(hostName)},
                           {"CreationClassName", CimValue::makeString("Talvex_EthernetPort")}}};
    }

    static ObjectPath identityPath(const std::string &cls, const std::string &instanceId) {
        return ObjectPath{"", kNs, cls, {{"InstanceID", CimValue::makeString(instanceId)}}};
    }
};

// Two adapters: nic0 (link up, 10000 Mb/s, MAC 02:1b:21:0a:0b:0c, driver
// netdrv 1.2.3, a firmware version wider than its record field) and nic1
// (link down).
std::string twoAdapterProfile(const std::string &faults = "") {
    return R"({"hostType": "Corlai", "adapters": [
        {"name": "nic0", "driverName": "netdrv", "driverVersion": "1.2.3",
         "firmwareVersion": "fw-9.0.0-with-a-text-wider-than-its-field",
         "interfaceName": "vmk-nic0", "capabilities": "0x800", "enabledCapabilities": "0x0",
         "pciBus": 16, "pciSlot": 2, "pciFunction": 1, "pciVendorId": "0x15", "pciDeviceId": "0x10fb",
         "linkUp": true, "speedMbps": 10000, "fullDuplex": true, "mac": "02:1b:21:0a:0b:0c", "mtu": 9000},
        {"name": "nic1", "driverName": "tg3", "driverVersion": "3.1", "firmwareVersion": "bc 5",
         "linkUp": false, "mac": "d0:94:66:1a:2b:3d", "mtu": 1500}
    ], "faults": [)" + faults + "]}";
}

struct FailureCase {
    const char *what;
    Response response;
    CMPIrc rc;
    const char *message;  // null: none expected
};

// The code and message, and nothing returned before or after the error.
void expectFailures(const std::vector<FailureCase> &cases) {
    for (const FailureCase &c : cases) {
        EXPECT_EQ(c.response.rc, c.rc) << c.what;
        EXPECT_EQ(c.response.message.value_or("<none>"), c.message ? c.message : "<none>") << c.what;
        EXPECT_TRUE(c.response.instances.empty() && c.response.paths.empty() && !c.response.done) << c.what;
    }
}

TEST_F(EthernetBroker, EveryFailureHasItsCodeAndMessage) {
    serve(twoAdapterProfile());
    const char *notValid = "DeviceID specified is not valid";
    const ObjectPath keyless = classPath("Talvex_EthernetPort");
    const ObjectPath elementWithoutDeviceId{
        "", kNs, "Talvex_EPDriverElementSoftwareIdentity",
        {{"Dependent", CimValue::makeReference(keyless)},
         {"Antecedent", CimValue::makeReference(identityPath("Talvex_EPDriverSoftwareIdentity", "x"))}}};
    Instance anyPort{portPath("nic0"), {}};
    Broker &b = *broker;
    expectFailures({
        {"ein unknown class", b.enumInstanceNames(classPath(kUnservedClass)), CMPI_RC_ERR_INVALID_CLASS, nullptr},
        {"ei unknown class", b.enumInstances(classPath(kUnservedClass), std::nullopt), CMPI_RC_ERR_INVALID_CLASS,
         nullptr},
        {"gi unknown class", b.getInstance(classPath(kUnservedClass), std::nullopt), CMPI_RC_ERR_NOT_FOUND, notValid},
        {"gi port without DeviceID", b.getInstance(keyless, std::nullopt), CMPI_RC_ERR_NOT_FOUND,
         "Specified DeviceID is not found"},
        {"gi identity without InstanceID",
         b.getInstance(classPath("Talvex_EPFirmwareSoftwareIdentity"), std::nullopt), CMPI_RC_ERR_INVALID_PARAMETER,
         notValid},
        {"gi association without DeviceID", b.getInstance(elementWithoutDeviceId, std::nullopt),
         CMPI_RC_ERR_INVALID_PARAMETER, notValid},
        {"create", b.createInstance(portPath("nic0"), anyPort), CMPI_RC_ERR_NOT_SUPPORTED, nullptr},
        {"set", b.setInstance(keyless, anyPort, std::nullopt), CMPI_RC_ERR_NOT_SUPPORTED, nullptr},
        {"delete", b.deleteInstance(portPath("no-such-port")), CMPI_RC_ERR_NOT_SUPPORTED, nullptr},
        {"ri port without DeviceID", b.references(keyless, "", "Dependent", std::nullopt),
         CMPI_RC_ERR_INVALID_PARAMETER, notValid},
        {"rin identity without InstanceID", b.referenceNames(classPath("Talvex_EPDriverSoftwareIdentity"), "", ""),
         CMPI_RC_ERR_INVALID_PARAMETER, notValid},
    });
    // Without Dependent the key cannot be read at all: a clear error, not a crash.
    const Response noDependent = b.getInstance(classPath("Talvex_EPFirmwareElementSoftwareIdentity"), std::nullopt);
    EXPECT_NE(noDependent.rc, CMPI_RC_OK);
    EXPECT_TRUE(noDependent.instances.empty());
}

// The values whose text a formatting fault would change: the MAC, the speed
// in bit/s (beyond 32 bits), the PCI numbers ("0x%u" is decimal, "0x%4x"
// pads), the capability bit and the link state.
TEST_F(EthernetBroker, PortValuesAsClientsReadThem) {
    serve(twoAdapterProfile());
    const Response response = broker->enumInstances(classPath("Talvex_EthernetPort"), std::nullopt);
    ASSERT_EQ(response.instances.size(), 2u) << response.message.value_or("");
    const std::map<std::string, std::string> nics[] = {literals(response.instances[0]),
                                                       literals(response.instances[1])};
    const struct {
        int nic;
        const char *property, *literal;
    } cases[] = {
        {0, "PermanentAddress", "\"021B210A0B0C\""},
        {0, "Speed", "10000000000"},
        {0, "OtherIdentifyingInfo", "{\"vmk-nic0\", \"0x16\", \"0x2\", \"0x1\", \"0x  15\", \"0x10fb\"}"},
        {0, "Capabilities", "{5}"},
        {0, "EnabledState", "2"},
        {1, "OperationalStatus", "{10}"},
    };
    for (const auto &c : cases) EXPECT_EQ(nics[c.nic].at(c.property), c.literal) << "nic" << c.nic << " " << c.property;
}

// The demo shows the version texts; here the firmware text cut to its
// record field before it is formatted, and the elements' status array.
TEST_F(EthernetBroker, FirmwareVersionKeepsItsFieldAndElementsTheirStatus) {
    serve(twoAdapterProfile());
    const Response firmware = broker->enumInstances(classPath("Talvex_EPFirmwareSoftwareIdentity"), std::nullopt);
    ASSERT_EQ(firmware.instances.size(), 2u);
    EXPECT_EQ(literals(firmware.instances[0]).at("VersionString"),
              "\"netdrv device firmware fw-9.0.0-with-a-text-wider-than\"");  // 31 characters kept
    const Response elements =
        broker->enumInstances(classPath("Talvex_EPFirmwareElementSoftwareIdentity"), std::nullopt);
    ASSERT_EQ(elements.instances.size(), 2u);
    EXPECT_EQ(literals(elements.instances[1]).at("ElementSoftwareStatus"), "{2}");
}

// The filter keeps out what the provider sets later; the class's defaults
// and the key of the provider's path are there before it, as in sfcb.
TEST_F(EthernetBroker, PropertyListFiltersPortsOnly) {
    serve(twoAdapterProfile());
    const PropertyList speedOnly = std::vector<std::string>{"Speed"};
    const Response ports = broker->enumInstances(classPath("Talvex_EthernetPort"), speedOnly);
    ASSERT_EQ(ports.instances.size(), 2u);
    using testing::Key;
    EXPECT_THAT(literals(ports.instances[0]),
                testing::UnorderedElementsAre(Key("Speed"), Key("DeviceID"), Key("EnabledState"), Key("RequestedState"),
                                              Key("EnabledDefault"), Key("TransitioningToState")));
    const Response drivers = broker->enumInstances(classPath("Talvex_EPDriverSoftwareIdentity"), speedOnly);
    ASSERT_EQ(drivers.instances.size(), 2u);
    EXPECT_EQ(literals(drivers.instances[0]).size(), 4u);  // IsEntity is a class default
}

// Lookups by the names the provider gives are the consistency suite's; these
// are the names a client may write otherwise.
TEST_F(EthernetBroker, LookupsMatchAdapterNamesWithoutRegardToCase) {
    serve(twoAdapterProfile());
    const struct {
        const char *what;
        ObjectPath path;
        const char *key, *found;
    } cases[] = {
        {"port by upper-case name", portPath("NIC0"), "DeviceID", "nic0"},
        {"class in other case",
         ObjectPath{"", kNs, "TALVEX_ethernetport", {{"DeviceID", CimValue::makeString("nic1")}}}, "DeviceID", "nic1"},
        {"whatever precedes the last colon", identityPath("Talvex_EPFirmwareSoftwareIdentity", "x:NIC1"), "InstanceID",
         "Talvex:Talvex_EPFirmwareSoftwareIdentity:nic1"},
        {"InstanceID without colon", identityPath("Talvex_EPDriverSoftwareIdentity", "nic0"), "InstanceID",
         "Talvex:Talvex_EPDriverSoftwareIdentity:nic0"},
    };
    for (const auto &c : cases) {
        const Response response = broker->getInstance(c.path, std::nullopt);
        ASSERT_EQ(response.instances.size(), 1u) << c.what << ": " << response.rc;
        EXPECT_EQ(response.instances[0].property(c.key)->text, c.found) << c.what;
    }
    // The provider answers OK with nothing; sfcb tells the client so.
    EXPECT_EQ(broker->getInstance(portPath("nic7"), std::nullopt).rc, CMPI_RC_ERR_NOT_FOUND);
    const Response names = broker->enumInstanceNames(classPath("talvex_ethernetport"));
    ASSERT_EQ(names.paths.size(), 2u);
    EXPECT_EQ(names.paths[0].className, "Talvex_EthernetPort");
}

// The traversal works from the paths alone, so it answers even on a host
// whose inventory fails.
const std::string driverNic0 =
    "root/cimv2:Talvex_EPDriverSoftwareIdentity.InstanceID=\"Talvex:Talvex_EPDriverSoftwareIdentity:nic0\"";
const std::string firmwareNic0 =
    "root/cimv2:Talvex_EPFirmwareSoftwareIdentity.InstanceID=\"Talvex:Talvex_EPFirmwareSoftwareIdentity:nic0\"";

TEST_F(EthernetBroker, EveryFilterNarrowsWhatIsFoundFromEitherEnd) {
    serve(twoAdapterProfile(R"({"call": "PRB_CheckSig"})"));
    const ObjectPath port = portPath("nic0");
    const ObjectPath firmware =
        identityPath("Talvex_EPFirmwareSoftwareIdentity", "Talvex:Talvex_EPFirmwareSoftwareIdentity:nic3");
    const std::string portNic3 = formatPath(portPath("nic3"));
    const struct {
        const char *what;
        const ObjectPath &from;
        std::string assocClass, resultClass, role, resultRole;
        std::vector<std::string> found;
    } cases[] = {
        {"result class firmware", port, "", "Talvex_EPFirmwareSoftwareIdentity", "", "", {firmwareNic0}},
        {"association and result class disagree", port, "Talvex_EPDriverElementSoftwareIdentity",
         "Talvex_EPFirmwareSoftwareIdentity", "", "", {}},
        {"role Dependent, any case", port, "", "", "dependent", "ANTECEDENT", {driverNic0, firmwareNic0}},
        {"role Antecedent", port, "", "", "Antecedent", "", {}},
        {"identity, result class base of the port", firmware, "", "CIM_NetworkPort", "Antecedent", "Dependent",
         {portNic3}},
        {"identity, role Dependent", firmware, "", "", "Dependent", "", {}},
    };
    for (const auto &c : cases) {
        const Response response = broker->associatorNames(c.from, c.assocClass, c.resultClass, c.role, c.resultRole);
        EXPECT_EQ(response.rc, CMPI_RC_OK) << c.what << ": " << response.message.value_or("");
        EXPECT_EQ(pathTexts(response), c.found) << c.what;
    }
}

TEST_F(EthernetBroker, ReferencesCarryBothEndsAndNoStatus) {
    serve(twoAdapterProfile(R"({"call": "PRB_CheckSig"})"));
    const Response refs = broker->references(portPath("nic9"), "", "", std::nullopt);
    ASSERT_EQ(refs.rc, CMPI_RC_OK) << refs.message.value_or("");
    ASSERT_EQ(refs.instances.size(), 2u) << "a port that does not exist still has both";
    EXPECT_EQ(refs.instances[0].path.className, "Talvex_EPDriverElementSoftwareIdentity");
    EXPECT_EQ(literals(refs.instances[0]).size(), 2u);
    const CimValue *dependent = refs.instances[0].property("Dependent");
    ASSERT_TRUE(dependent != nullptr && dependent->reference);
    EXPECT_EQ(formatPath(*dependent->reference), formatPath(portPath("nic9")));
}

}  // namespace
}  // namespace ethernettest
