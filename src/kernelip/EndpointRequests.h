// The instance requests of the kernel IP endpoint classes. Each reads the
// kernel afresh; the provider object only forwards to these.
#pragma once

#include "CmpiBroker.h"
#include "CmpiObjectPath.h"
#include "CmpiResult.h"
#include "CmpiStatus.h"

namespace TVX {

// The records of the class, or of both when a parent class is named, in
// record order. Nothing at all (not even the done mark) for another class or
// when the inventory fails or is empty.
CmpiStatus enumEndpoints(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                         const char **properties, CmpiBroker *broker);

// The first record of the path's class whose interface name is the key
// "Name". A parent class, or a failing inventory, answers OK with nothing.
CmpiStatus getEndpoint(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                       const char **properties, CmpiBroker *broker);

}  // namespace TVX
