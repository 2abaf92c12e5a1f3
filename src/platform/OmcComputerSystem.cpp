#include "platform/OmcComputerSystem.h"

#include <limits.h>
#include <unistd.h>

namespace OMC {

std::string getComputerSystemClassName() { return "OMC_UnitaryComputerSystem"; }

std::string getComputerSystemName(const CmpiContext &, CmpiBroker *) {
    char name[HOST_NAME_MAX + 1] = {};
    // An empty name would leave every path naming the host unusable; "localhost" still names it.
    if (gethostname(name, sizeof name - 1) != 0 || name[0] == '\0') return "localhost";
    return name;
}

}  // namespace OMC
