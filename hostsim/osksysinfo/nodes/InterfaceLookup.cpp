#include "nodes/InterfaceLookup.h"

#include "hostsim/HostSimControl.h"
#include "nodes/NodeParams.h"

namespace hostsim {

int findNamedInterface(const HostProfile &profile, const PRB_ParamList *params, std::size_t paramCount,
                       const InterfaceProfile *&interface) {
    const std::string *name = paramAt<std::string>(params, 0, paramCount);
    if (name == nullptr) return HOSTSIM_STATUS_BAD_ARGUMENT;
    interface = profile.interfaces.find(*name);
    return interface == nullptr ? HOSTSIM_STATUS_NOT_FOUND : HOSTSIM_STATUS_OK;
}

}  // namespace hostsim
