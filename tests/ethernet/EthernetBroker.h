// The Ethernet port provider in the embedded broker, with the paths of its
// classes and a host profile of two adapters.
#pragma once

#include "ProductBroker.h"

namespace ethernettest {

using namespace producttest;

// Served by the Ethernet port provider in these tests only.
inline constexpr const char *kUnservedClass = "Test_UnservedPort";

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
inline std::string twoAdapterProfile(const std::string &faults = "") {
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

// The path a reference property holds, as text; empty when it holds none.
inline std::string referenceText(const Instance &instance, const char *property) {
    const CimValue *value = instance.property(property);
    return value != nullptr && value->reference ? formatPath(*value->reference) : std::string();
}

}  // namespace ethernettest
