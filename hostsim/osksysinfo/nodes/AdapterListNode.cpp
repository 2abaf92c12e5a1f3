// Node 70: the instance list of the physical network adapters, one name each.
#include "hostsim/HostSimControl.h"
#include "nodes/NodeParams.h"
#include "nodes/NodeRegistry.h"

namespace hostsim {

namespace {

int listAdapters(const HostProfile &profile, const PRB_ParamList *parent,
                 std::unique_ptr<PRB_ParamList> &out) {
    if (!hasNoParams(parent)) return HOSTSIM_STATUS_BAD_ARGUMENT;
    for (const AdapterProfile &adapter : profile.adapters) out->entries.push_back(PRB_Param{adapter.name});
    return HOSTSIM_STATUS_OK;
}

const NodeRegistration adapterList({70, listAdapters, 0, nullptr});

}  // namespace

}  // namespace hostsim
