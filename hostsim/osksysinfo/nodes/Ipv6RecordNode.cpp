// Node 244: the 68-byte record of one IPv6 address, named by two texts: the
// interface and the address's instance. Bytes 0-47 hold the address text
// (terminated only when shorter), 48-51 the prefix length.
#include "hostsim/HostSimControl.h"
#include "nodes/InterfaceLookup.h"
#include "nodes/NodeParams.h"
#include "nodes/NodeRegistry.h"
#include "nodes/RecordBytes.h"

namespace hostsim {

namespace {

constexpr std::size_t addressWidth = 48;

int readIpv6Record(const HostProfile &profile, const PRB_ParamList *params, unsigned char *record) {
    const std::string *instance = paramAt<std::string>(params, 1, 2);
    if (instance == nullptr) return HOSTSIM_STATUS_BAD_ARGUMENT;
    const InterfaceProfile *interface = nullptr;
    const int status = findNamedInterface(profile, params, 2, interface);
    if (status != HOSTSIM_STATUS_OK) return status;
    const Ipv6Profile *address = interface->findIpv6(*instance);
    if (address == nullptr) return HOSTSIM_STATUS_NOT_FOUND;
    putText(record, addressWidth, address->address);
    putUnsigned(record + addressWidth, address->prefixLength, 4);
    return HOSTSIM_STATUS_OK;
}

const NodeRegistration ipv6Record({244, nullptr, 68, readIpv6Record});

}  // namespace

}  // namespace hostsim
