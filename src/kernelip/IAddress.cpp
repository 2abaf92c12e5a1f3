#include "kernelip/IAddress.h"

#include <stdexcept>

#include "kernelip/EndpointProperties.h"

namespace TVX {
namespace {

std::int32_t familyOf(const ifaddrs *entry) {
    if (entry->ifa_addr == nullptr || entry->ifa_netmask == nullptr) {
        throw std::invalid_argument("Entry without an address or a netmask");
    }
    return entry->ifa_addr->sa_family;
}

}  // namespace

IAddress::IAddress(const ifaddrs *entry) : family(familyOf(entry)) {}

CmpiInstance IAddress::newEndpointInstance(const CmpiContext &ctx, CmpiBroker *broker,
                                           const std::string &interfaceName,
                                           std::int32_t protocolIFType) const {
    const std::string className = getCreationClassName();
    CmpiInstance instance(CmpiObjectPath(kKernelIpNamespace, className.c_str()));
    setEndpointIdentity(instance, className.c_str(), interfaceName.c_str(), protocolIFType, ctx, broker);
    return instance;
}

}  // namespace TVX
