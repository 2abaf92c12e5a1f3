// What every kernel IP endpoint instance carries, whoever builds it: the
// class names, and the properties that come first, in their order.
#pragma once

#include <cstdint>

#include "CmpiBroker.h"
#include "CmpiInstance.h"

namespace TVX {

constexpr const char *ipv4EndpointClass = "Talvex_KernelIPv4ProtocolEndpoint";
constexpr const char *ipv6EndpointClass = "Talvex_KernelIPv6ProtocolEndpoint";

// The system's and the endpoint's keys, the names and ProtocolIFType.
void setEndpointIdentity(CmpiInstance &instance, const char *className, const char *interfaceName,
                         std::int32_t protocolType, const CmpiContext &ctx, CmpiBroker *broker);

}  // namespace TVX
