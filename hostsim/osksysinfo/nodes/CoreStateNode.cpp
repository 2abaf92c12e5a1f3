// Node 799: a core's 160-byte state record; the state byte is at offset 64.
#include "nodes/NodeRegistry.h"
#include "nodes/NumberedInstances.h"
#include "nodes/RecordBytes.h"

namespace hostsim {

namespace {

int readCoreState(const HostProfile &profile, const PRB_ParamList *params, unsigned char *record) {
    return readNumbered(profile.processors.cores, params,
                        [record](const CoreProfile &core) { putUnsigned(record + 64, core.state, 1); });
}

const NodeRegistration coreState({799, nullptr, 160, readCoreState});

}  // namespace

}  // namespace hostsim
