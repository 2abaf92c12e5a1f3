// Node 214: the instance list of the kernel's IP interfaces, one name each.
#include <string>

#include "hostsim/HostSimControl.h"
#include "nodes/NodeParams.h"
#include "nodes/NodeRegistry.h"

namespace hostsim {

namespace {

int listInterfaces(const HostProfile &profile, const PRB_ParamList *parent, std::unique_ptr<PRB_ParamList> &out) {
    if (!hasNoParams(parent)) return HOSTSIM_STATUS_BAD_ARGUMENT;
    profile.interfaces.eachName([&out](std::string name) { out->entries.push_back(PRB_Param{std::move(name)}); });
    return HOSTSIM_STATUS_OK;
}

const NodeRegistration interfaceList({214, listInterfaces, 0, nullptr});

}  // namespace

}  // namespace hostsim
