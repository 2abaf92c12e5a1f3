// A fresh inventory of the host's physical network adapters.
#pragma once

#include <vector>

#include "ethernet/PnicDetails.h"

namespace EthernetProvider {

// Appends one record per adapter, in the kernel's order. Returns 0 on
// success, 1 when a kernel information call failed (records of the adapters
// before the failing one stay in the list).
unsigned int getPnicDetails(std::vector<PnicDetails> &pnics);

}  // namespace EthernetProvider
