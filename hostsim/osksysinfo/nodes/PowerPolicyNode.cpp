// Node 1443: the host's 588-byte power-policy record; the policy name is the
// text at offset 8.
#include "nodes/NodeParams.h"
#include "nodes/NodeRegistry.h"
#include "nodes/RecordBytes.h"

namespace hostsim {

namespace {

int readPowerPolicy(const HostProfile &profile, const PRB_ParamList *params, unsigned char *record) {
    return readWithoutParams(params,
                             [&profile, record] { putText(record + 8, 588 - 8, profile.processors.powerPolicy); });
}

const NodeRegistration powerPolicy({1443, nullptr, 588, readPowerPolicy});

}  // namespace

}  // namespace hostsim
