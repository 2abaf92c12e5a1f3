// The Ethernet port provider as a client sees it through the broker: its
// failure statuses, the port, identity and association instances built from
// the inventory, lookups by key, and association traversal.
#include <functional>

#include "EthernetBroker.h"
#include "model/PathText.h"

namespace ethernettest {
namespace {

using Request = std::function<Response(Broker &)>;

struct FailureCase {
    const char *what;
    Request request;
    CMPIrc rc;
    const char *message;  // null: none expected
};

void expectFailures(Broker &broker, const std::vector<FailureCase> &cases) {
    for (const FailureCase &c : cases) {
        const Response response = c.request(broker);
        EXPECT_EQ(response.rc, c.rc) << c.what;
        if (c.message != nullptr) {
            EXPECT_EQ(response.message.value_or("<none>"), c.message) << c.what;
        } else {
            EXPECT_FALSE(response.message.has_value()) << c.what << ": " << *response.message;
        }
        EXPECT_TRUE(response.instances.empty() && response.paths.empty()) << c.what;
        EXPECT_FALSE(response.done) << c.what;
    }
}

TEST_F(EthernetBroker, InventoryFailureFailsEveryInventoryOperation) {
    serve(twoAdapterProfile(R"({"call": "PRB_Get", "node": 72, "instance": "nic1"})"));
    const char *failed = "Failed to get pnics information";
    expectFailures(*broker, {
        {"ein port", [](Broker &b) { return b.enumInstanceNames(classPath("Talvex_EthernetPort")); },
         CMPI_RC_ERR_FAILED, failed},
        {"ei driver", [](Broker &b) { return b.enumInstances(classPath("Talvex_EPDriverSoftwareIdentity"), std::nullopt); },
         CMPI_RC_ERR_FAILED, failed},
        {"gi port nic0", [this](Broker &b) { return b.getInstance(portPath("nic0"), std::nullopt); },
         CMPI_RC_ERR_FAILED, failed},
    });
}

TEST_F(EthernetBroker, EveryOtherFailureHasItsCodeAndMessage) {
    serve(twoAdapterProfile());
    const char *notValid = "DeviceID specified is not valid";
    const ObjectPath keyless = classPath("Talvex_EthernetPort");
    const ObjectPath elementWithoutDeviceId{
        "", kNs, "Talvex_EPDriverElementSoftwareIdentity",
        {{"Dependent", CimValue::makeReference(keyless)},
         {"Antecedent", CimValue::makeReference(identityPath("Talvex_EPDriverSoftwareIdentity", "x"))}}};
    Instance anyPort{portPath("nic0"), {}};
    expectFailures(*broker, {
        {"ein unknown class", [](Broker &b) { return b.enumInstanceNames(classPath(kUnservedClass)); },
         CMPI_RC_ERR_INVALID_CLASS, nullptr},
        {"ei unknown class", [](Broker &b) { return b.enumInstances(classPath(kUnservedClass), std::nullopt); },
         CMPI_RC_ERR_INVALID_CLASS, nullptr},
        {"gi unknown class", [](Broker &b) { return b.getInstance(classPath(kUnservedClass), std::nullopt); },
         CMPI_RC_ERR_NOT_FOUND, notValid},
        {"gi port without DeviceID", [&](Broker &b) { return b.getInstance(keyless, std::nullopt); },
         CMPI_RC_ERR_NOT_FOUND, "Specified DeviceID is not found"},
        {"gi identity without InstanceID",
         [](Broker &b) { return b.getInstance(classPath("Talvex_EPFirmwareSoftwareIdentity"), std::nullopt); },
         CMPI_RC_ERR_INVALID_PARAMETER, notValid},
        {"gi association without DeviceID",
         [&](Broker &b) { return b.getInstance(elementWithoutDeviceId, std::nullopt); },
         CMPI_RC_ERR_INVALID_PARAMETER, notValid},
        {"create", [&](Broker &b) { return b.createInstance(portPath("nic0"), anyPort); },
         CMPI_RC_ERR_NOT_SUPPORTED, nullptr},
        {"set", [&](Broker &b) { return b.setInstance(keyless, anyPort, std::nullopt); },
         CMPI_RC_ERR_NOT_SUPPORTED, nullptr},
        {"delete", [&](Broker &b) { return b.deleteInstance(portPath("no-such-port")); },
         CMPI_RC_ERR_NOT_SUPPORTED, nullptr},
        {"ri port without DeviceID", [&](Broker &b) { return b.references(keyless, "", "Dependent", std::nullopt); },
         CMPI_RC_ERR_INVALID_PARAMETER, notValid},
        {"rin identity without InstanceID",
         [](Broker &b) { return b.referenceNames(classPath("Talvex_EPDriverSoftwareIdentity"), "", ""); },
         CMPI_RC_ERR_INVALID_PARAMETER, notValid},
    });
}

TEST_F(EthernetBroker, AnAssociationPathWithoutDependentIsAClearError) {
    serve(twoAdapterProfile());
    const Response response =
        broker->getInstance(classPath("Talvex_EPFirmwareElementSoftwareIdentity"), std::nullopt);
    EXPECT_NE(response.rc, CMPI_RC_OK);
    EXPECT_TRUE(response.instances.empty());
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

TEST_F(EthernetBroker, PortInstanceCarriesEveryPropertyWithItsType) {
    serve(twoAdapterProfile());
    const Response response = broker->enumInstances(classPath("Talvex_EthernetPort"), std::nullopt);
    ASSERT_TRUE(response.ok()) << response.message.value_or("");
    ASSERT_EQ(response.instances.size(), 2u);
    EXPECT_EQ(formatPath(response.instances[0].path), "root/cimv2:Talvex_EthernetPort.DeviceID=\"nic0\"");

    const auto nic0 = literals(response.instances[0]);
    const auto nic0Types = types(response.instances[0]);
    const struct {
        const char *name;
        CMPIType type;
        std::string literal;
    } expected[] = {
        {"SystemCreationClassName", CMPI_string, "\"OMC_UnitaryComputerSystem\""},
        {"SystemName", CMPI_string, "\"" + hostName + "\""},
        {"CreationClassName", CMPI_string, "\"Talvex_EthernetPort\""},
        {"DeviceID", CMPI_string, "\"nic0\""},
        {"Name", CMPI_string, "\"nic0\""},
        {"ElementName", CMPI_string, "\"nic0\""},
        {"PortType", CMPI_uint16, "0"},
        {"AutoSense", CMPI_uint16, "0"},
        {"Caption", CMPI_string, "\"nic0\""},
        {"Speed", CMPI_uint64, "1000000000"},
        {"LinkTechnology", CMPI_uint16, "2"},
        {"PermanentAddress", CMPI_string, "\"021B210A0B0C\""},
        {"NetworkAddresses", CMPI_stringA, "{\"021B210A0B0C\"}"},
        {"RequestedState", CMPI_uint16, "5"},
        {"EnabledState", CMPI_uint16, "2"},
        {"OperationalStatus", CMPI_uint16A, "{2}"},
        {"Capabilities", CMPI_uint16A, "{5}"},
        {"EnabledCapabilities", CMPI_uint16A, "{0}"},
        {"FullDuplex", CMPI_boolean, "TRUE"},
        {"ActiveMaximumTransmissionUnit", CMPI_uint64, "9000"},
        {"OtherIdentifyingInfo", CMPI_stringA,
         "{\"vmk-nic0\", \"0x16\", \"0x2\", \"0x1\", \"0x  15\", \"0x10fb\"}"},
        {"IdentifyingDescriptions", CMPI_stringA,
         "{\"Interface Name\", \"PCI Bus\", \"PCI Slot\", \"PCI Function\", \"PCI Vendor\", \"PCI DeviceID\"}"},
    };
    EXPECT_EQ(nic0.size(), std::size(expected));
    for (const auto &property : expected) {
        EXPECT_EQ(nic0Types.at(property.name), property.type) << property.name;
        EXPECT_EQ(nic0.at(property.name), property.literal) << property.name;
    }
    const auto nic1 = literals(response.instances[1]);
    EXPECT_EQ(nic1.at("EnabledState"), "3");
    EXPECT_EQ(nic1.at("OperationalStatus"), "{10}");
    EXPECT_EQ(nic1.at("FullDuplex"), "FALSE");
}

TEST_F(EthernetBroker, IdentitiesAndElementsOfEachAdapter) {
    serve(twoAdapterProfile());
    const struct {
        const char *cls;
        std::vector<std::string> literals;  // of nic0, in the order set
    } cases[] = {
        {"Talvex_EPDriverSoftwareIdentity",
         {"\"Talvex:Talvex_EPDriverSoftwareIdentity:nic0\"", "\"netdrv driver \"", "\"netdrv driver 1.2.3\""}},
        {"Talvex_EPFirmwareSoftwareIdentity",
         {"\"Talvex:Talvex_EPFirmwareSoftwareIdentity:nic0\"", "\"netdrv device firmware \"",
          "\"netdrv device firmware fw-9\""}},
    };
    for (const auto &c : cases) {
        const Response response = broker->enumInstances(classPath(c.cls), std::nullopt);
        ASSERT_EQ(response.instances.size(), 2u) << c.cls;
        const auto found = literals(response.instances[0]);
        EXPECT_EQ(found.at("InstanceID"), c.literals[0]);
        EXPECT_EQ(found.at("ElementName"), c.literals[1]);
        EXPECT_EQ(found.at("VersionString"), c.literals[2]);
    }
    const Response elements =
        broker->enumInstances(classPath("Talvex_EPFirmwareElementSoftwareIdentity"), std::nullopt);
    ASSERT_EQ(elements.instances.size(), 2u);
    EXPECT_EQ(formatPath(elements.instances[1].path), "root/cimv2:Talvex_EPFirmwareElementSoftwareIdentity");
    const auto element = literals(elements.instances[1]);
    EXPECT_EQ(referenceText(elements.instances[1], "Dependent"), formatPath(portPath("nic1")));
    EXPECT_EQ(referenceText(elements.instances[1], "Antecedent"),
              "root/cimv2:Talvex_EPFirmwareSoftwareIdentity.InstanceID=\"Talvex:Talvex_EPFirmwareSoftwareIdentity:nic1\"");
    EXPECT_EQ(element.at("ElementSoftwareStatus"), "{2}");

    const Response names =
        broker->enumInstanceNames(classPath("Talvex_EPFirmwareElementSoftwareIdentity"));
    ASSERT_EQ(names.paths.size(), 2u);
    EXPECT_EQ(names.paths[1].key("Dependent")->reference->className, "Talvex_EthernetPort");
    EXPECT_EQ(names.paths[1].key("Antecedent")->reference->className, "Talvex_EPFirmwareSoftwareIdentity");
}

TEST_F(EthernetBroker, PropertyListFiltersPortsOnly) {
    serve(twoAdapterProfile());
    const PropertyList speedOnly = std::vector<std::string>{"Speed"};
    const Response ports = broker->enumInstances(classPath("Talvex_EthernetPort"), speedOnly);
    ASSERT_EQ(ports.instances.size(), 2u);
    EXPECT_EQ(literals(ports.instances[0]).size(), 1u);
    const Response drivers = broker->enumInstances(classPath("Talvex_EPDriverSoftwareIdentity"), speedOnly);
    ASSERT_EQ(drivers.instances.size(), 2u);
    EXPECT_EQ(literals(drivers.instances[0]).size(), 3u);
}

TEST_F(EthernetBroker, LookupsMatchAdapterNamesWithoutRegardToCase) {
    serve(twoAdapterProfile());
    const ObjectPath element{"", kNs, "Talvex_EPDriverElementSoftwareIdentity",
                             {{"Dependent", CimValue::makeReference(portPath("nic1"))},
                              {"Antecedent", CimValue::makeReference(identityPath("Talvex_EPDriverSoftwareIdentity", "?"))}}};
    const struct {
        const char *what;
        ObjectPath path;
        std::vector<std::string> found;
    } cases[] = {
        {"port by upper-case name", portPath("NIC0"), {"root/cimv2:Talvex_EthernetPort.DeviceID=\"nic0\""}},
        {"class in other case", ObjectPath{"", kNs, "TALVEX_ethernetport", {{"DeviceID", CimValue::makeString("nic1")}}},
         {"root/cimv2:Talvex_EthernetPort.DeviceID=\"nic1\""}},
        {"port that does not exist", portPath("nic7"), {}},
        {"firmware by InstanceID", identityPath("Talvex_EPFirmwareSoftwareIdentity", "Talvex:Talvex_EPFirmwareSoftwareIdentity:nic1"),
         {"root/cimv2:Talvex_EPFirmwareSoftwareIdentity.InstanceID=\"Talvex:Talvex_EPFirmwareSoftwareIdentity:nic1\""}},
        {"whatever precedes the last colon", identityPath("Talvex_EPFirmwareSoftwareIdentity", "x:NIC1"),
         {"root/cimv2:Talvex_EPFirmwareSoftwareIdentity.InstanceID=\"Talvex:Talvex_EPFirmwareSoftwareIdentity:nic1\""}},
        {"InstanceID without colon", identityPath("Talvex_EPDriverSoftwareIdentity", "nic0"),
         {"root/cimv2:Talvex_EPDriverSoftwareIdentity.InstanceID=\"Talvex:Talvex_EPDriverSoftwareIdentity:nic0\""}},
        {"association by its Dependent", element, {"root/cimv2:Talvex_EPDriverElementSoftwareIdentity"}},
    };
    for (const auto &c : cases) {
        const Response response = broker->getInstance(c.path, std::nullopt);
        EXPECT_EQ(response.rc, CMPI_RC_OK) << c.what;
        EXPECT_EQ(pathTexts(response.instances), c.found) << c.what;
    }
    const Response names = broker->enumInstanceNames(classPath("talvex_ethernetport"));
    ASSERT_EQ(names.paths.size(), 2u);
    EXPECT_EQ(names.paths[0].className, "Talvex_EthernetPort");
}

}  // namespace
}  // namespace ethernettest
