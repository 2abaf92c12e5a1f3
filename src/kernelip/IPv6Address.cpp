#include "kernelip/IPv6Address.h"

#include <arpa/inet.h>
#include <netinet/in.h>

#include <cstring>

#include "kernelip/EndpointDetails.h"
#include "kernelip/EndpointProperties.h"

namespace TVX {
namespace {

const in6_addr &ipv6Of(const sockaddr *socketAddress) {
    return reinterpret_cast<const sockaddr_in6 *>(socketAddress)->sin6_addr;
}

}  // namespace

IPv6Address::IPv6Address(const ifaddrs *entry) : IAddress(entry), prefixLength(0) {
    if (inet_ntop(AF_INET6, &ipv6Of(entry->ifa_addr), address, sizeof address) == nullptr) {
        address[0] = '\0';
    }
    prefixLength = getPrefix(&ipv6Of(entry->ifa_netmask), sizeof(in6_addr));
}

int IPv6Address::getPrefix(const void *mask, int length) {
    const auto *bytes = static_cast<const unsigned char *>(mask);
    int index = 0;
    while (index < length && bytes[index] == 0xFF) ++index;
    int prefix = 8 * index;
    if (index >= length) return prefix;
    const unsigned int partial = bytes[index];
    unsigned int bit = 0x80;
    for (; (partial & bit) != 0; bit >>= 1) ++prefix;
    // The bits below the first zero bit, and every later byte, must be zero.
    if ((partial & (bit - 1)) != 0) return 0;
    for (++index; index < length; ++index) {
        if (bytes[index] != 0) return 0;
    }
    return prefix;
}

CmpiInstance IPv6Address::buildInterfaceObject(const CmpiContext &ctx, CmpiBroker *broker,
                                               const std::string &interfaceName) const {
    CmpiInstance instance = newEndpointInstance(ctx, broker, interfaceName, protocolIPv6);
    instance.setProperty("IPv6Address", CmpiData(address));
    instance.setProperty("PrefixLength", CmpiData(static_cast<CMPIUint8>(prefixLength)));
    return instance;
}

bool IPv6Address::isEqual(const IAddress *other) const {
    const auto *ipv6 = dynamic_cast<const IPv6Address *>(other);
    if (ipv6 == nullptr) return false;
    if (ipv6 == this) return true;
    return std::strcmp(address, ipv6->address) == 0;
}

std::string IPv6Address::getAddress() const { return address; }

std::string IPv6Address::getCreationClassName() const { return ipv6EndpointClass; }

}  // namespace TVX
