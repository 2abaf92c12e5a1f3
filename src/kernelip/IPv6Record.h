// Decoding of the kernel's record of one IPv6 address (node 244).
#pragma once

#include <cstddef>

#include "kernelip/EndpointDetails.h"

namespace TVX {

constexpr std::size_t ipv6RecordSize = 68;

// Fills ipv6Address (at most 48 characters: the text need not be
// terminated within its field) and ipv6PrefixLength; nothing else.
void decodeIPv6Record(const unsigned char (&record)[ipv6RecordSize], endpointDetails &endpoint);

}  // namespace TVX
