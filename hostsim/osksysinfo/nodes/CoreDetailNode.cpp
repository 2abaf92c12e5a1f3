// Node 800: a core's 76-byte detail record. Its content is of no use to the
// product, which needs only the query to succeed, so it is all zeros.
#include "nodes/NodeRegistry.h"
#include "nodes/NumberedInstances.h"

namespace hostsim {

namespace {

int readCoreDetail(const HostProfile &profile, const PRB_ParamList *params, unsigned char *) {
    return readNumbered(profile.processors.cores, params, [](const CoreProfile &) {});
}

const NodeRegistration coreDetail({800, nullptr, 76, readCoreDetail});

}  // namespace

}  // namespace hostsim
