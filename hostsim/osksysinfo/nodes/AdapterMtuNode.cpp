// Node 74: the MTU of the adapter named by the parameter list, 4 bytes.
#include "hostsim/HostSimControl.h"
#include "nodes/AdapterLookup.h"
#include "nodes/NodeRegistry.h"
#include "nodes/RecordBytes.h"

namespace hostsim {

namespace {

int readAdapterMtu(const HostProfile &profile, const PRB_ParamList *params, unsigned char *record) {
    const AdapterProfile *adapter = nullptr;
    const int status = findNamedAdapter(profile, params, adapter);
    if (status == HOSTSIM_STATUS_OK) putUnsigned(record, adapter->mtu, 4);
    return status;
}

const NodeRegistration adapterMtu({74, nullptr, 4, readAdapterMtu});

}  // namespace

}  // namespace hostsim
