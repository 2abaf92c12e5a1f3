#include "processor/GetProcessorDetails.h"

#include <climits>
#include <cstdio>
#include <cstring>

#include "frame/LittleEndian.h"
#include "platform/ParamList.h"
#include "platform/SystemInfoSignature.h"
#include "processor/CpuidRecord.h"
#include "processor/HostProcessorSettings.h"

namespace Processor {
namespace {

constexpr int hardwareThreadNode = 605;
constexpr int modelTextNode = 606;
constexpr int coreNode = 607;
constexpr int packageNode = 608;
constexpr int coreStateNode = 799;
constexpr int coreStateDetailNode = 800;
constexpr int powerPolicyNode = 1443;

constexpr std::size_t coreStateRecordSize = 160;
constexpr std::size_t coreStateAt = 64;
constexpr std::size_t coreStateDetailSize = 76;

constexpr uint32_t cpuEnabled = 1;
constexpr uint32_t cpuIdle = 4;
constexpr unsigned int failed = 1;

template <std::size_t size>
bool readNode(int node, PRB_ParamList *params, unsigned char (&buffer)[size]) {
    return PRB_Get(node, params, buffer, static_cast<int>(size)) == 0;
}

bool readHostSettings(HostProcessorSettings &host) {
    return readNode(powerPolicyNode, nullptr, host.powerPolicy) &&
           readNode(hardwareThreadNode, nullptr, host.hardwareThreads) &&
           readNode(modelTextNode, nullptr, host.modelText);
}

// Puts the instance number at `index` of `list` last on `params`. An index
// beyond what a list can hold fails like any index past its end.
bool pushInstance(PRB_ParamList *list, uint64_t index, PRB_ParamList *params) {
    int32_t instance = 0;
    return index <= uint64_t(INT_MAX) &&
           PRB_ParamListGetInt32(list, static_cast<int>(index), &instance) == 0 &&
           PRB_ParamListAddInt(params, instance) == 0;
}

bool readPackage(PRB_ParamList *packages, int index, PRB_ParamList *params,
                 const HostProcessorSettings &host, std::vector<ProcessorDetails> &out) {
    ProcessorDetails details;
    std::memset(&details, 0, sizeof details);
    std::snprintf(details.deviceId, sizeof details.deviceId, "cpu-%u", unsigned(index));

    unsigned char coreCount[4] = {};
    if (!pushInstance(packages, unsigned(index), params) ||
        !readNode(packageNode, params, coreCount)) {
        return false;
    }
    details.enabledCores = frame::littleEndian(coreCount, sizeof coreCount);
    applyHostSettings(host, details);
    out.push_back(details);
    PRB_ParamListRemoveLastParam(params);
    return true;
}

// The package's CPUID data comes from its first core.
bool readCpuid(PRB_ParamList *cores, uint64_t base, PRB_ParamList *params,
               ProcessorDetails &details) {
    unsigned char record[cpuidRecordSize] = {};
    if (!pushInstance(cores, base, params) || !readNode(coreNode, params, record)) return false;
    decodeCpuidRecord(record, details);
    PRB_ParamListRemoveLastParam(params);
    return true;
}

// A package is enabled as soon as one of its cores is busy.
bool readCoreStates(PRB_ParamList *cores, uint64_t base, PRB_ParamList *params,
                    ProcessorDetails &details) {
    details.cpuStatus = cpuIdle;
    for (uint64_t core = 0; core < details.enabledCores; ++core) {
        unsigned char state[coreStateRecordSize] = {};
        if (!pushInstance(cores, base + core, params) ||
            !readNode(coreStateNode, params, state)) {
            return false;
        }
        if (state[coreStateAt] != 0) {
            unsigned char detail[coreStateDetailSize] = {};
            if (!readNode(coreStateDetailNode, params, detail)) return false;
            PRB_ParamListRemoveLastParam(params);
            details.cpuStatus = cpuEnabled;
            return true;
        }
        PRB_ParamListRemoveLastParam(params);
    }
    return true;
}

}  // namespace

unsigned int getProcessorDetails(std::vector<ProcessorDetails> &out) {
    if (!platform::systemInfoUsable()) return failed;

    HostProcessorSettings host;
    std::memset(&host, 0, sizeof host);
    if (!readHostSettings(host)) return failed;

    platform::ParamList packages;
    if (PRB_GetInstanceListAlloc(packageNode, nullptr, packages.receive()) != 0) return failed;
    if (!packages) return 0;

    const int count = PRB_ParamListUsedCount(packages.get());
    platform::ParamList packageParams(PRB_ParamListCreate(1, 1));
    if (!packageParams) return failed;
    const std::size_t first = out.size();
    for (int index = 0; index < count; ++index) {
        if (!readPackage(packages.get(), index, packageParams.get(), host, out)) return failed;
    }

    platform::ParamList cores;
    if (PRB_GetInstanceListAlloc(coreNode, nullptr, cores.receive()) != 0) return failed;
    platform::ParamList coreParams(PRB_ParamListCreate(1, 1));
    if (!coreParams) return failed;

    uint64_t base = 0;
    for (std::size_t i = first; i < out.size(); ++i) {
        ProcessorDetails &details = out[i];
        if (!readCpuid(cores.get(), base, coreParams.get(), details) ||
            !readCoreStates(cores.get(), base, coreParams.get(), details)) {
            return failed;
        }
        base += details.enabledCores;
    }
    return 0;
}

}  // namespace Processor
