// The kernel's IP interfaces, read afresh through the system-information
// library: per interface its IPv4 record, then its IPv6 records.
#pragma once

#include <vector>

#include "kernelip/EndpointDetails.h"

namespace TVX {

// Appends one record per address; 0 on success, 1 on failure (records read
// before a failure stay appended, and callers discard them).
unsigned int getendpointDetails(std::vector<endpointDetails> &endpoints);

}  // namespace TVX
