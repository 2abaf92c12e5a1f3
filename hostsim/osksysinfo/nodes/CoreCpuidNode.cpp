// Node 607: the cores of every package, package 0's first. The instance list
// holds their numbers; a core's value is its 200-byte CPUID record.
#include <cstring>

#include "nodes/NodeRegistry.h"
#include "nodes/NumberedInstances.h"
#include "nodes/RecordBytes.h"

namespace hostsim {

namespace {

constexpr std::size_t cpuidRecordSize = 200;

void encodeCpuidRecord(const CpuidProfile &cpuid, unsigned char *record) {
    putUnsigned(record + 3, cpuid.stepping, 1);
    // Leaf 0 holds the vendor string in EBX, EDX, ECX order, as stored at
    // offsets 48, 56 and 52.
    std::memcpy(record + 48, cpuid.vendor.data(), 4);
    std::memcpy(record + 56, cpuid.vendor.data() + 4, 4);
    std::memcpy(record + 52, cpuid.vendor.data() + 8, 4);
    putUnsigned(record + 64, cpuid.leaf1Ebx, 4);
    putUnsigned(record + 68, cpuid.leaf1Ecx, 4);
    putUnsigned(record + 100, cpuid.extendedEcx, 4);
    putUnsigned(record + 104, cpuid.extendedEdx, 4);
}

int listCores(const HostProfile &profile, const PRB_ParamList *parent, std::unique_ptr<PRB_ParamList> &out) {
    return listNumbered(profile.processors.cores, parent, *out);
}

int readCpuidRecord(const HostProfile &profile, const PRB_ParamList *params, unsigned char *record) {
    return readNumbered(profile.processors.cores, params,
                        [record](const CoreProfile &core) { encodeCpuidRecord(core.cpuid, record); });
}

const NodeRegistration cores({607, listCores, cpuidRecordSize, readCpuidRecord});

}  // namespace

}  // namespace hostsim
