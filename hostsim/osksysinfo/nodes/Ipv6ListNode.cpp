// Node 243: the instance list of an interface's IPv6 addresses; the parent
// list names the interface.
#include "hostsim/HostSimControl.h"
#include "nodes/InterfaceLookup.h"
#include "nodes/NodeRegistry.h"

namespace hostsim {

namespace {

int listIpv6(const HostProfile &profile, const PRB_ParamList *parent, std::unique_ptr<PRB_ParamList> &out) {
    const InterfaceProfile *interface = nullptr;
    const int status = findNamedInterface(profile, parent, 1, interface);
    if (status != HOSTSIM_STATUS_OK) return status;
    for (const Ipv6Profile &address : interface->ipv6) out->entries.push_back(PRB_Param{address.instance});
    return HOSTSIM_STATUS_OK;
}

const NodeRegistration ipv6List({243, listIpv6, 0, nullptr});

}  // namespace

}  // namespace hostsim
