// The Ethernet port provider as a client sees it through the broker: its
// failure statuses, the values a formatting fault would change, the property
// filter, and lookups by names other than its own.
#include <gmock/gmock.h>

#include "EthernetBroker.h"

namespace ethernettest {
namespace {

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

    serve(twoAdapterProfile(R"({"call": "PRB_Get", "node": 72, "instance": "nic1"})"));
    const char *failed = "Failed to get pnics information";
    expectFailures({
        {"ein port", b.enumInstanceNames(classPath("Talvex_EthernetPort")), CMPI_RC_ERR_FAILED, failed},
        {"gi port nic0", b.getInstance(portPath("nic0"), std::nullopt), CMPI_RC_ERR_FAILED, failed},
    });
}

TEST_F(EthernetBroker, AnEmptyHostAnswersEveryClassWithNothing) {
    serve(R"({"hostType": "Corlai", "adapters": []})");
    for (const char *cls : {"Talvex_EthernetPort", kUnservedClass}) {
        const Response response = broker->enumInstanceNames(classPath(cls));
        EXPECT_EQ(response.rc, CMPI_RC_OK) << cls;
        EXPECT_TRUE(response.paths.empty()) << cls;
        EXPECT_TRUE(response.done) << cls;
    }
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
        {0, "NetworkAddresses", "{\"021B210A0B0C\"}"},
        {0, "Speed", "10000000000"},
        {0, "OtherIdentifyingInfo", "{\"vmk-nic0\", \"0x16\", \"0x2\", \"0x1\", \"0x  15\", \"0x10fb\"}"},
        {0, "Capabilities", "{5}"},
        {0, "EnabledCapabilities", "{0}"},
        {0, "ActiveMaximumTransmissionUnit", "9000"},
        {0, "EnabledState", "2"},
        {0, "FullDuplex", "TRUE"},
        {1, "OperationalStatus", "{10}"},
        {1, "FullDuplex", "FALSE"},
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

}  // namespace
}  // namespace ethernettest
