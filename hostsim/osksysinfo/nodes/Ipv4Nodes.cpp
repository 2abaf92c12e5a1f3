// Nodes 239 and 240: the IPv4 address and netmask of the interface named by
// the parameter list, 4 bytes each in network byte order. An interface
// without an IPv4 address has neither.
#include <cstring>

#include "hostsim/HostSimControl.h"
#include "nodes/InterfaceLookup.h"
#include "nodes/NodeRegistry.h"

namespace hostsim {

namespace {

template <Ipv4Bytes Ipv4Profile::*field>
int readIpv4(const HostProfile &profile, const PRB_ParamList *params, unsigned char *record) {
    const InterfaceProfile *interface = nullptr;
    const int status = findNamedInterface(profile, params, 1, interface);
    if (status != HOSTSIM_STATUS_OK) return status;
    if (!interface->ipv4) return HOSTSIM_STATUS_NOT_FOUND;
    const Ipv4Bytes &bytes = (*interface->ipv4).*field;
    std::memcpy(record, bytes.data(), bytes.size());
    return HOSTSIM_STATUS_OK;
}

const NodeRegistration ipv4Address({239, nullptr, 4, readIpv4<&Ipv4Profile::address>});
const NodeRegistration ipv4Netmask({240, nullptr, 4, readIpv4<&Ipv4Profile::netmask>});

}  // namespace

}  // namespace hostsim
