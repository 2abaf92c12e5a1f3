// Node 72: the adapter record of the adapter named by the parameter list.
#include "hostsim/HostSimControl.h"
#include "nodes/AdapterLookup.h"
#include "nodes/AdapterRecord.h"
#include "nodes/NodeRegistry.h"

namespace hostsim {

namespace {

int readAdapterRecord(const HostProfile &profile, const PRB_ParamList *params, unsigned char *record) {
    const AdapterProfile *adapter = nullptr;
    const int status = findNamedAdapter(profile, params, adapter);
    if (status == HOSTSIM_STATUS_OK) encodeAdapterRecord(*adapter, record);
    return status;
}

const NodeRegistration adapterRecord({72, nullptr, adapterRecordSize, readAdapterRecord});

}  // namespace

}  // namespace hostsim
