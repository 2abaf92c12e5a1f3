// One physical network adapter of the simulated host: its instance name and
// everything its adapter record (node 72) and MTU (node 74) carry.
#pragma once

#include <cstdint>
#include <memory>
#include <string>

namespace hostsim {

// Served as given; longer than their field they are cut to the field width
// without a terminator.
struct AdapterTexts {
    std::string driverName;
    std::string driverVersion;
    std::string firmwareVersion;
    std::string interfaceName;
    std::string mac;  // any text, so unparseable addresses can be served
};

struct AdapterProfile {
    std::string name;  // the adapter's entry in the node-70 instance list
    // Never null. The adapters of an entry with a count share one, so a few
    // long texts cannot turn into gigabytes.
    std::shared_ptr<const AdapterTexts> texts;
    std::uint32_t capabilities = 0;
    std::uint32_t enabledCapabilities = 0;
    std::uint32_t pciBus = 0;
    std::uint32_t pciSlot = 0;
    std::uint32_t pciFunction = 0;
    std::uint16_t pciVendorId = 0;
    std::uint16_t pciDeviceId = 0;
    std::uint8_t linkUp = 0;
    std::uint16_t speedMbps = 0;
    std::uint8_t fullDuplex = 0;
    std::uint32_t mtu = 1500;
};

}  // namespace hostsim
