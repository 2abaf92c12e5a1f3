// Node 605: the host's 36-byte hardware-thread record; word 0 is non-zero when
// the processors run hardware threads.
#include "nodes/NodeParams.h"
#include "nodes/NodeRegistry.h"
#include "nodes/RecordBytes.h"

namespace hostsim {

namespace {

int readHardwareThreads(const HostProfile &profile, const PRB_ParamList *params, unsigned char *record) {
    return readWithoutParams(params,
                             [&profile, record] { putUnsigned(record, profile.processors.hardwareThreads, 4); });
}

const NodeRegistration hardwareThreads({605, nullptr, 36, readHardwareThreads});

}  // namespace

}  // namespace hostsim
