#include "kernelip/IPv4Address.h"

#include <arpa/inet.h>
#include <netinet/in.h>

#include <cstring>
#include <stdexcept>

#include "kernelip/EndpointDetails.h"
#include "kernelip/EndpointProperties.h"

namespace TVX {
namespace {

const in_addr &ipv4Of(const sockaddr *socketAddress) {
    return reinterpret_cast<const sockaddr_in *>(socketAddress)->sin_addr;
}

}  // namespace

IPv4Address::IPv4Address(const ifaddrs *entry) : IAddress(entry) {
    if (inet_ntop(AF_INET, &ipv4Of(entry->ifa_addr), address, sizeof address) == nullptr) {
        throw std::invalid_argument("Address conversion failed");
    }
    if (inet_ntop(AF_INET, &ipv4Of(entry->ifa_netmask), netmask, sizeof netmask) == nullptr) {
        netmask[0] = '\0';
    }
}

CmpiInstance IPv4Address::buildInterfaceObject(const CmpiContext &ctx, CmpiBroker *broker,
                                               const std::string &interfaceName) const {
    CmpiInstance instance = newEndpointInstance(ctx, broker, interfaceName, protocolIPv4);
    instance.setProperty("IPv4Address", CmpiData(address));
    instance.setProperty("SubnetMask", CmpiData(netmask));
    return instance;
}

bool IPv4Address::isEqual(const IAddress *other) const {
    const auto *ipv4 = dynamic_cast<const IPv4Address *>(other);
    if (ipv4 == nullptr) return false;
    if (ipv4 == this) return true;
    return std::strcmp(address, ipv4->address) == 0 && std::strcmp(netmask, ipv4->netmask) == 0;
}

std::string IPv4Address::getAddress() const { return address; }

std::string IPv4Address::getCreationClassName() const { return ipv4EndpointClass; }

}  // namespace TVX
