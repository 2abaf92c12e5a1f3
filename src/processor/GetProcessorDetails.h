// A fresh inventory of the host's physical processor packages.
#pragma once

#include <vector>

#include "processor/ProcessorDetails.h"

namespace Processor {

// Appends one record per package, in the kernel's order, so a record's
// position is the number in its deviceId. Returns 0 on success, 1 when a
// kernel information call failed (records appended before it stay).
unsigned int getProcessorDetails(std::vector<ProcessorDetails> &out);

}  // namespace Processor
