// The instance requests of Talvex_Processor. Each takes a fresh inventory;
// the provider object only forwards to these.
#pragma once

#include "CmpiBroker.h"
#include "CmpiObjectPath.h"
#include "CmpiResult.h"
#include "CmpiStatus.h"

namespace Processor {

// Every package, or nothing at all (not even the done mark) when the class
// is another one or the inventory fails or is empty.
CmpiStatus enumProcessors(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                          const char **properties, CmpiBroker *broker);

// The package whose position is the number after the last hyphen of DeviceID.
CmpiStatus getProcessor(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                        const char **properties, CmpiBroker *broker);

// That number read as strtol reads it, or -1 when DeviceID has no hyphen.
long processorPosition(const char *deviceId);

}  // namespace Processor
