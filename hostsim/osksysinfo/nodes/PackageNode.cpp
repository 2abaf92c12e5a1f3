// Node 608: the processor packages. The instance list holds their numbers;
// a package's value is its core count, 4 bytes.
#include "nodes/NodeRegistry.h"
#include "nodes/NumberedInstances.h"
#include "nodes/RecordBytes.h"

namespace hostsim {

namespace {

int listPackages(const HostProfile &profile, const PRB_ParamList *parent, std::unique_ptr<PRB_ParamList> &out) {
    const int status = listNumbered(profile.processors.packages, parent, *out);
    if (!profile.processors.packageListServed) out.reset();
    return status;
}

int readCoreCount(const HostProfile &profile, const PRB_ParamList *params, unsigned char *record) {
    return readNumbered(profile.processors.packages, params,
                        [record](const PackageProfile &package) { putUnsigned(record, package.coreCount, 4); });
}

const NodeRegistration packages({608, listPackages, 4, readCoreCount});

}  // namespace

}  // namespace hostsim
