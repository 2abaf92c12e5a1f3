// Node 606: the host's processor model text, 48 bytes, terminated only when
// shorter.
#include "nodes/NodeParams.h"
#include "nodes/NodeRegistry.h"
#include "nodes/RecordBytes.h"

namespace hostsim {

namespace {

int readProcessorModel(const HostProfile &profile, const PRB_ParamList *params, unsigned char *record) {
    return readWithoutParams(params, [&profile, record] { putText(record, 48, profile.processors.modelText); });
}

const NodeRegistration processorModel({606, nullptr, 48, readProcessorModel});

}  // namespace

}  // namespace hostsim
