// One physical network adapter as the kernel and its driver describe it.
#pragma once

#include <cstdint>

namespace EthernetProvider {

struct PnicDetails {
    char name[128];
    uint32_t portType;
    uint8_t autoSense;
    uint32_t speedMbps;
    uint32_t capabilities;
    uint32_t enabledCapabilities;
    uint8_t linkUp;
    uint8_t macAddress[6];
    char driverName[32];
    char driverVersion[32];
    char firmwareVersion[32];
    char interfaceName[32];
    uint32_t pciBus;
    uint32_t pciSlot;
    uint32_t pciFunction;
    uint32_t pciVendorId;
    uint32_t pciDeviceId;
    uint8_t fullDuplex;
    uint32_t mtu;
};

}  // namespace EthernetProvider
