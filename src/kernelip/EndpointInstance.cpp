#include "kernelip/EndpointInstance.h"

#include <arpa/inet.h>

#include "CmpiObjectPath.h"

namespace TVX {
namespace {

constexpr CMPIUint16 enabledStateDisabled = 6;

// inet_ntoa's shared buffer would let two requests overwrite each other's text.
CmpiData dottedDecimal(uint32_t networkOrder) {
    in_addr address{};
    address.s_addr = networkOrder;
    char text[INET_ADDRSTRLEN] = {};
    ::inet_ntop(AF_INET, &address, text, sizeof text);
    return CmpiData(text);
}

}  // namespace

CmpiInstance buildEndpointInstance(const endpointDetails &record, const CmpiString &ns,
                                   const char **properties, const char *className,
                                   const CmpiContext &ctx, CmpiBroker *broker) {
    CmpiInstance instance(CmpiObjectPath(ns, className));
    instance.setPropertyFilter(properties, nullptr);

    setEndpointIdentity(instance, className, record.name, record.protocolType, ctx, broker);
    if (record.protocolType == protocolIPv4) {
        instance.setProperty("IPv4Address", dottedDecimal(record.ipv4Address));
        instance.setProperty("SubnetMask", dottedDecimal(record.ipv4Netmask));
        if (record.ipv4Address == 0) instance.setProperty("EnabledState", CmpiData(enabledStateDisabled));
    } else {
        instance.setProperty("IPv6Address", CmpiData(record.ipv6Address));
        instance.setProperty("PrefixLength", CmpiData(CMPIUint8(record.ipv6PrefixLength & 0xff)));
    }
    return instance;
}

}  // namespace TVX
