// The Talvex_Processor instance of one package record.
#pragma once

#include "CmpiBroker.h"
#include "CmpiInstance.h"
#include "CmpiString.h"
#include "processor/ProcessorDetails.h"

namespace Processor {

constexpr const char *processorClass = "Talvex_Processor";

CmpiInstance buildProcessorInstance(const CmpiString &ns, const ProcessorDetails &record,
                                    const CmpiContext &ctx, CmpiBroker *broker,
                                    const char **properties);

}  // namespace Processor
