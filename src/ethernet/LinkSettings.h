// What the adapter's driver says about its link: the CIM port type and
// whether it autonegotiates.
#pragma once

#include <cstddef>
#include <cstdint>

#include "ethernet/PnicDetails.h"

namespace EthernetProvider {

// The CIM port type of a physical port kind and speed; 0 when unknown.
uint32_t portTypeFor(uint8_t port, uint16_t speedMbps);

// "/dev/char/oskdriver/" and the (already cut) interface-request name.
void formatDriverDevicePath(char *path, std::size_t pathSize, const char *requestName);

// Sets portType and autoSense from the ethtool reply; leaves both alone when
// the driver cannot be asked.
void queryLinkSettings(const char *adapterName, PnicDetails &details);

}  // namespace EthernetProvider
