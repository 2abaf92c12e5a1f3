// The Ethernet port provider as a client sees it through the broker: its
// factories, its failure statuses, the port, identity and association
// instances built from the inventory, and lookups by key.
#include <gmock/gmock.h>

#include "EthernetBroker.h"
#include "model/CimTypes.h"

namespace ethernettest {
namespace {

struct FailureCase {
    const char *what;
    Response response;
    CMPIrc rc;
    const char *message;  // null: none expected
};

void expectFailures(const std::vector<FailureCase> &cases) {
    for (const FailureCase &c : cases) {
        EXPECT_EQ(c.response.rc, c.rc) << c.what;
        if (c.message != nullptr) {
            EXPECT_EQ(c.response.message.value_or("<none>"), c.message) << c.what;
        } else {
            EXPECT_FALSE(c.response.message.has_value()) << c.what << ": " << *c.response.message;
        }
        EXPECT_TRUE(c.response.instances.empty() && c.response.paths.empty()) << c.what;
        EXPECT_FALSE(c.response.done) << c.what;
    }
}

TEST_F(EthernetBroker, BothFactoriesShareOneProviderAndOnlyTheInstanceOneAnnouncesIt) {
    testing::internal::CaptureStderr();
    auto *association = static_cast<CMPIAssociationMI *>(
        broker->managementInterface("EthernetPortProvider", InterfaceKind::Association));
    const std::string afterAssociation = testing::internal::GetCapturedStderr();
    testing::internal::CaptureStderr();
    auto *instance = static_cast<CMPIInstanceMI *>(
        broker->managementInterface("EthernetPortProvider", InterfaceKind::Instance));
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "--- _Create_InstanceMI() P10CmpiBaseMI\n");
    EXPECT_EQ(afterAssociation, "");
    ASSERT_TRUE(association && instance);
    EXPECT_EQ(instance->hdl, association->hdl);
    EXPECT_STREQ(instance->ft->miName, "instanceEthernetPortProvider");
    EXPECT_STREQ(association->ft->miName, "associationEthernetPortProvider");
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
        {"ei driver", b.enumInstances(classPath("Talvex_EPDriverSoftwareIdentity"), std::nullopt), CMPI_RC_ERR_FAILED,
         failed},
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

// Every property as a client of sfcb shows it: the class's defaults and the
// key of the provider's path first, then the rest in the order set; the
// path is made of the class's keys. The types after, since MOF text does
// not tell how wide an integer is.
TEST_F(EthernetBroker, PortInstanceCarriesEveryPropertyWithItsType) {
    serve(twoAdapterProfile());
    const Response response = broker->enumInstances(classPath("Talvex_EthernetPort"), std::nullopt);
    ASSERT_TRUE(response.ok()) << response.message.value_or("");
    ASSERT_EQ(response.instances.size(), 2u);
    const Instance &nic0 = response.instances[0];
    EXPECT_EQ(formatInstanceMof(nic0), R"(// root/cimv2:Talvex_EthernetPort.SystemCreationClassName="OMC_UnitaryComputerSystem",SystemName=")" +
                                           hostName + R"(",CreationClassName="Talvex_EthernetPort",DeviceID="nic0"
instance of Talvex_EthernetPort
{
    EnabledState = 2;
    RequestedState = 5;
    EnabledDefault = 2;
    TransitioningToState = 12;
    DeviceID = "nic0";
    SystemCreationClassName = "OMC_UnitaryComputerSystem";
    SystemName = ")" + hostName + R"(";
    CreationClassName = "Talvex_EthernetPort";
    Name = "nic0";
    ElementName = "nic0";
    PortType = 0;
    AutoSense = 0;
    Caption = "nic0";
    Speed = 1000000000;
    LinkTechnology = 2;
    PermanentAddress = "021B210A0B0C";
    NetworkAddresses = {"021B210A0B0C"};
    OperationalStatus = {2};
    Capabilities = {5};
    EnabledCapabilities = {0};
    FullDuplex = TRUE;
    ActiveMaximumTransmissionUnit = 9000;
    OtherIdentifyingInfo = {"vmk-nic0", "0x16", "0x2", "0x1", "0x  15", "0x10fb"};
    IdentifyingDescriptions = {"Interface Name", "PCI Bus", "PCI Slot", "PCI Function", "PCI Vendor", "PCI DeviceID"};
};
)");
    std::string types;
    for (const NamedValue &property : nic0.properties) {
        types += cimTypeName(property.value.elementType()) + (property.value.isArray() ? "[] " : " ");
    }
    EXPECT_EQ(types, "uint16 uint16 uint16 uint16 string string string string string string uint16 uint16 string "
                     "uint64 uint16 string string[] uint16[] uint16[] uint16[] boolean uint64 string[] string[] ");
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
          "\"netdrv device firmware fw-9.0.0-with-a-text-wider-than\""}},  // 31 characters kept
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
    EXPECT_EQ(elements.instances[1].path.keys.size(), 2u) << "a client's path is made of both references";
    EXPECT_EQ(referenceText(elements.instances[1], "Dependent"), formatPath(portPath("nic1")));
    EXPECT_EQ(referenceText(elements.instances[1], "Antecedent"),
              "root/cimv2:Talvex_EPFirmwareSoftwareIdentity.InstanceID=\"Talvex:Talvex_EPFirmwareSoftwareIdentity:nic1\"");
    EXPECT_EQ(literals(elements.instances[1]).at("ElementSoftwareStatus"), "{2}");
}

// The filter keeps out what the provider sets later; the class's defaults
// and the key of the provider's path are there before it, as in sfcb.
TEST_F(EthernetBroker, PropertyListFiltersPortsOnly) {
    serve(twoAdapterProfile());
    const PropertyList speedOnly = std::vector<std::string>{"Speed"};
    const Response ports = broker->enumInstances(classPath("Talvex_EthernetPort"), speedOnly);
    ASSERT_EQ(ports.instances.size(), 2u);
    EXPECT_THAT(literals(ports.instances[0]),
                testing::UnorderedElementsAre(testing::Key("Speed"), testing::Key("DeviceID"), testing::Key("EnabledState"),
                                              testing::Key("RequestedState"), testing::Key("EnabledDefault"),
                                              testing::Key("TransitioningToState")));
    const Response drivers = broker->enumInstances(classPath("Talvex_EPDriverSoftwareIdentity"), speedOnly);
    ASSERT_EQ(drivers.instances.size(), 2u);
    EXPECT_EQ(literals(drivers.instances[0]).size(), 3u);
}

// Lookups by the names the provider gives are the consistency suite's.
TEST_F(EthernetBroker, LookupsMatchAdapterNamesWithoutRegardToCase) {
    serve(twoAdapterProfile());
    // A port's path as a client sees it: the class's keys in their order.
    const auto clientPortText = [&](const char *deviceId) {
        return "root/cimv2:Talvex_EthernetPort.SystemCreationClassName=\"OMC_UnitaryComputerSystem\",SystemName=\"" +
               hostName + "\",CreationClassName=\"Talvex_EthernetPort\",DeviceID=\"" + deviceId + "\"";
    };
    const struct {
        const char *what;
        ObjectPath path;
        std::vector<std::string> found;
    } cases[] = {
        {"port by upper-case name", portPath("NIC0"), {clientPortText("nic0")}},
        {"class in other case", ObjectPath{"", kNs, "TALVEX_ethernetport", {{"DeviceID", CimValue::makeString("nic1")}}},
         {clientPortText("nic1")}},
        {"whatever precedes the last colon", identityPath("Talvex_EPFirmwareSoftwareIdentity", "x:NIC1"),
         {"root/cimv2:Talvex_EPFirmwareSoftwareIdentity.InstanceID=\"Talvex:Talvex_EPFirmwareSoftwareIdentity:nic1\""}},
        {"InstanceID without colon", identityPath("Talvex_EPDriverSoftwareIdentity", "nic0"),
         {"root/cimv2:Talvex_EPDriverSoftwareIdentity.InstanceID=\"Talvex:Talvex_EPDriverSoftwareIdentity:nic0\""}},
    };
    for (const auto &c : cases) {
        const Response response = broker->getInstance(c.path, std::nullopt);
        EXPECT_EQ(response.rc, CMPI_RC_OK) << c.what;
        EXPECT_EQ(pathTexts(response), c.found) << c.what;
    }
    // The provider answers OK with nothing; sfcb tells the client so.
    EXPECT_EQ(broker->getInstance(portPath("nic7"), std::nullopt).rc, CMPI_RC_ERR_NOT_FOUND);
    const Response names = broker->enumInstanceNames(classPath("talvex_ethernetport"));
    ASSERT_EQ(names.paths.size(), 2u);
    EXPECT_EQ(names.paths[0].className, "Talvex_EthernetPort");
}

}  // namespace
}  // namespace ethernettest
