// The keys that name the hosting computer system in every path that refers
// to it. Both are plain strings: they set a CmpiData key or property as
// they are, and c_str() gives the text where a char pointer is wanted.
#pragma once

#include <string>

#include "CmpiBroker.h"

namespace OMC {

std::string getComputerSystemClassName();

// The host's name as the system reports it. The context and broker are
// those of the calling provider; the name does not depend on them.
std::string getComputerSystemName(const CmpiContext &ctx, CmpiBroker *broker);

}  // namespace OMC
