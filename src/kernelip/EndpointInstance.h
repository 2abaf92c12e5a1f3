// The endpoint instance of one inventory record.
#pragma once

#include "CmpiBroker.h"
#include "CmpiInstance.h"
#include "CmpiString.h"
#include "kernelip/EndpointDetails.h"

namespace TVX {

constexpr const char *ipv4EndpointClass = "Talvex_KernelIPv4ProtocolEndpoint";
constexpr const char *ipv6EndpointClass = "Talvex_KernelIPv6ProtocolEndpoint";

// Properties outside the list are left out by the instance's own filter.
CmpiInstance buildEndpointInstance(const endpointDetails &record, const CmpiString &ns,
                                   const char **properties, const char *className,
                                   const CmpiContext &ctx, CmpiBroker *broker);

}  // namespace TVX
