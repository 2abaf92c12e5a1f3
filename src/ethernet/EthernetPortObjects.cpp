#include "ethernet/EthernetPortObjects.h"

#include <cstdio>
#include <cstring>

#include "CmpiArray.h"
#include "frame/BoundedText.h"
#include "frame/SingleElementArray.h"
#include "platform/OmcComputerSystem.h"

namespace EthernetProvider {
namespace {

using frame::singleElementArray;

constexpr CMPIUint16 linkTechnologyEthernet = 2;
constexpr CMPIUint16 requestedStateNoChange = 5;
constexpr CMPIUint16 enabledStateEnabled = 2;
constexpr CMPIUint16 enabledStateDisabled = 3;
constexpr CMPIUint16 operationalStatusOk = 2;
constexpr CMPIUint16 operationalStatusStopped = 10;
constexpr CMPIUint16 elementSoftwareStatusCurrent = 2;
constexpr uint32_t capabilityBit = 0x800;
constexpr CMPIUint16 capabilityValue = 5;

std::string formatted(const char *format, uint32_t value) {
    char text[32];
    std::snprintf(text, sizeof text, format, value);
    return text;
}

std::string macText(const uint8_t (&mac)[6]) {
    char text[13];
    std::snprintf(text, sizeof text, "%02X%02X%02X%02X%02X%02X", mac[0], mac[1], mac[2], mac[3],
                  mac[4], mac[5]);
    return text;
}

void setIdentifyingArrays(CmpiInstance &instance, const PnicDetails &pnic) {
    // "0x%u" really is decimal behind the prefix; clients have always seen it so.
    const std::string info[] = {
        pnic.interfaceName,
        formatted("0x%u", pnic.pciBus),
        formatted("0x%u", pnic.pciSlot),
        formatted("0x%u", pnic.pciFunction),
        formatted("0x%4x", pnic.pciVendorId),
        formatted("0x%4x", pnic.pciDeviceId),
    };
    const char *descriptions[] = {"Interface Name", "PCI Bus",    "PCI Slot",
                                  "PCI Function",   "PCI Vendor", "PCI DeviceID"};
    CmpiArray infoArray(6, CMPI_string);
    CmpiArray descriptionArray(6, CMPI_string);
    for (unsigned int i = 0; i < 6; ++i) {
        infoArray[i] = CmpiData(info[i]);
        descriptionArray[i] = CmpiData(descriptions[i]);
    }
    instance.setProperty("OtherIdentifyingInfo", infoArray);
    instance.setProperty("IdentifyingDescriptions", descriptionArray);
}

CMPIUint16 capabilityOf(uint32_t bits) { return (bits & capabilityBit) != 0 ? capabilityValue : 0; }

}  // namespace

CmpiStatus deviceIdNotValid() {
    return CmpiStatus(CMPI_RC_ERR_INVALID_PARAMETER, "DeviceID specified is not valid");
}

CmpiObjectPath buildPortPath(const CmpiContext &ctx, CmpiBroker *broker, const CmpiString &ns,
                             const char *deviceId) {
    CmpiObjectPath path(ns, portClass);
    path.setKey("DeviceID", CmpiData(deviceId));
    path.setKey("SystemCreationClassName", CmpiData(OMC::getComputerSystemClassName()));
    path.setKey("SystemName", CmpiData(OMC::getComputerSystemName(ctx, broker)));
    path.setKey("CreationClassName", CmpiData(portClass));
    return path;
}

CmpiObjectPath buildIdentityPath(const IdentityKind &kind, const CmpiString &ns,
                                 const char *deviceId) {
    CmpiObjectPath path(ns, kind.identityClass);
    path.setKey("InstanceID", CmpiData(std::string(kind.instanceIdPrefix) + deviceId));
    return path;
}

std::string deviceIdFromInstanceId(const char *instanceId) {
    const char *lastColon = std::strrchr(instanceId, ':');
    char deviceId[128];
    frame::copyBounded(deviceId, lastColon != nullptr ? lastColon + 1 : instanceId,
                       std::strlen(instanceId));
    return deviceId;
}

CmpiInstance buildPortInstance(const CmpiContext &ctx, CmpiBroker *broker, const CmpiString &ns,
                               const PnicDetails &pnic, const char **properties) {
    CmpiObjectPath ownPath(ns, portClass);
    ownPath.setKey("DeviceID", CmpiData(pnic.name));
    CmpiInstance instance(ownPath);
    instance.setPropertyFilter(properties, nullptr);

    const std::string mac = macText(pnic.macAddress);
    const bool linkUp = pnic.linkUp != 0;
    instance.setProperty("SystemCreationClassName", CmpiData(OMC::getComputerSystemClassName()));
    instance.setProperty("SystemName", CmpiData(OMC::getComputerSystemName(ctx, broker)));
    instance.setProperty("CreationClassName", CmpiData(portClass));
    instance.setProperty("DeviceID", CmpiData(pnic.name));
    instance.setProperty("Name", CmpiData(pnic.name));
    instance.setProperty("ElementName", CmpiData(pnic.name));
    instance.setProperty("PortType", CmpiData(CMPIUint16(pnic.portType)));
    instance.setProperty("AutoSense", CmpiData(CMPIUint16(pnic.autoSense != 0 ? 1 : 0)));
    instance.setProperty("Caption", CmpiData(pnic.name));
    instance.setProperty("Speed", CmpiData(CMPIUint64(pnic.speedMbps) * 1000000u));
    instance.setProperty("LinkTechnology", CmpiData(linkTechnologyEthernet));
    instance.setProperty("PermanentAddress", CmpiData(mac));
    instance.setProperty("NetworkAddresses", singleElementArray(CMPI_string, mac));
    instance.setProperty("RequestedState", CmpiData(requestedStateNoChange));
    instance.setProperty("EnabledState",
                         CmpiData(linkUp ? enabledStateEnabled : enabledStateDisabled));
    instance.setProperty(
        "OperationalStatus",
        singleElementArray(CMPI_uint16, linkUp ? operationalStatusOk : operationalStatusStopped));
    instance.setProperty("Capabilities",
                         singleElementArray(CMPI_uint16, capabilityOf(pnic.capabilities)));
    instance.setProperty("EnabledCapabilities",
                         singleElementArray(CMPI_uint16, capabilityOf(pnic.enabledCapabilities)));
    instance.setProperty("FullDuplex", CmpiData(pnic.fullDuplex != 0));
    instance.setProperty("ActiveMaximumTransmissionUnit", CmpiData(CMPIUint64(pnic.mtu)));
    setIdentifyingArrays(instance, pnic);
    return instance;
}

CmpiInstance buildIdentityInstance(const IdentityKind &kind, const CmpiString &ns,
                                   const PnicDetails &pnic) {
    const std::string element = std::string(pnic.driverName) + kind.elementNameSuffix;
    const CmpiObjectPath path = buildIdentityPath(kind, ns, pnic.name);
    CmpiInstance instance(path);
    instance.setProperty("InstanceID", path.getKey("InstanceID"));
    instance.setProperty("ElementName", CmpiData(element));
    instance.setProperty("VersionString",
                         CmpiData(element + (pnic.*kind.version)));
    return instance;
}

CmpiInstance buildElementInstance(const IdentityKind &kind, const CmpiString &ns,
                                  const CmpiObjectPath &port, const CmpiObjectPath &identity,
                                  bool withStatus) {
    CmpiInstance instance(CmpiObjectPath(ns, kind.elementClass));
    instance.setProperty("Dependent", CmpiData(port));
    instance.setProperty("Antecedent", CmpiData(identity));
    if (withStatus) {
        instance.setProperty("ElementSoftwareStatus",
                             singleElementArray(CMPI_uint16, elementSoftwareStatusCurrent));
    }
    return instance;
}

CmpiObjectPath buildElementPath(const IdentityKind &kind, const CmpiString &ns,
                                const CmpiObjectPath &port, const CmpiObjectPath &identity) {
    CmpiObjectPath path(ns, kind.elementClass);
    path.setKey("Dependent", CmpiData(port));
    path.setKey("Antecedent", CmpiData(identity));
    return path;
}

}  // namespace EthernetProvider
