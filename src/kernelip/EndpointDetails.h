// One IP address of one kernel network interface, as the endpoint inventory
// reads it. Plain value: the fields of the other family stay zero.
#pragma once

#include <cstdint>

namespace TVX {

constexpr int32_t protocolIPv4 = 4096;
constexpr int32_t protocolIPv6 = 4097;

struct endpointDetails {
    char name[151];
    uint32_t ipv4Address;  // network byte order
    uint32_t ipv4Netmask;  // network byte order
    char ipv6Address[49];
    uint32_t ipv6PrefixLength;
    int32_t protocolType;  // protocolIPv4 or protocolIPv6
};

}  // namespace TVX
