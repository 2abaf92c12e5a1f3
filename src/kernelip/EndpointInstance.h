// The endpoint instance of one inventory record.
#pragma once

#include "CmpiBroker.h"
#include "CmpiInstance.h"
#include "CmpiString.h"
#include "kernelip/EndpointDetails.h"
#include "kernelip/EndpointProperties.h"

namespace TVX {

// Properties outside the list are left out by the instance's own filter.
CmpiInstance buildEndpointInstance(const endpointDetails &record, const CmpiString &ns,
                                   const char **properties, const char *className,
                                   const CmpiContext &ctx, CmpiBroker *broker);

}  // namespace TVX
