#include "nodes/AdapterLookup.h"

#include "hostsim/HostSimControl.h"
#include "nodes/NodeParams.h"

namespace hostsim {

int findNamedAdapter(const HostProfile &profile, const PRB_ParamList *params, const AdapterProfile *&adapter) {
    const std::string *name = soleParam<std::string>(params);
    if (name == nullptr) return HOSTSIM_STATUS_BAD_ARGUMENT;
    adapter = profile.findAdapter(*name);
    return adapter == nullptr ? HOSTSIM_STATUS_NOT_FOUND : HOSTSIM_STATUS_OK;
}

}  // namespace hostsim
