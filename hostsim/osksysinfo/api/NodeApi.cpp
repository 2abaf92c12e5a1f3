// Reading kernel information nodes: the signature check, instance lists and
// values, served from the current host profile.
#include <cstring>
#include <memory>
#include <vector>

#include "api/ExportedApi.h"
#include "nodes/NodeParams.h"
#include "nodes/NodeRegistry.h"
#include "serving/ListRegistry.h"
#include "serving/ProfileStore.h"

using namespace hostsim;

namespace {

// Written into the caller's work area, so a short one shows under a sanitizer.
constexpr char signature[] = "OSKSYSINFO-HOSTSIM-1";
static_assert(sizeof signature == 21, "the work area is 21 bytes");

int checkSignature(char *workArea, int workAreaLength) {
    if (workArea == nullptr || workAreaLength < int(sizeof signature)) return HOSTSIM_STATUS_BAD_ARGUMENT;
    const Consultation consulted = ProfileStore::instance().consult({Operation::CheckSig, {}, {}});
    if (!consulted.profile) return HOSTSIM_STATUS_NO_PROFILE;
    if (consulted.fault) return HOSTSIM_STATUS_INJECTED;
    std::memcpy(workArea, signature, sizeof signature);
    return HOSTSIM_STATUS_OK;
}

}  // namespace

int PRB_CheckSig(char *workArea, int workAreaLength, int *result) {
    const int status = checkSignature(workArea, workAreaLength);
    if (result != nullptr) *result = status;
    return status;
}

int PRB_GetInstanceListAlloc(int node, PRB_ParamList *parent, PRB_ParamList **list) {
    if (list == nullptr) return HOSTSIM_STATUS_BAD_ARGUMENT;
    *list = nullptr;
    const Consultation consulted =
        ProfileStore::instance().consult({Operation::GetInstanceListAlloc, node, lastParamText(parent)});
    if (!consulted.profile) return HOSTSIM_STATUS_NO_PROFILE;
    if (consulted.fault) return consulted.fault->noList ? HOSTSIM_STATUS_OK : HOSTSIM_STATUS_INJECTED;
    const NodeDefinition *definition = findNode(node);
    if (definition == nullptr || definition->listInstances == nullptr) return HOSTSIM_STATUS_UNKNOWN_NODE;
    auto instances = std::make_unique<PRB_ParamList>();
    const int status = definition->listInstances(*consulted.profile, parent, instances);
    if (status == HOSTSIM_STATUS_OK && instances) *list = ListRegistry::instance().handOut(std::move(instances));
    return status;
}

int PRB_Get(int node, PRB_ParamList *params, void *buffer, int bufferSize) {
    if (buffer == nullptr || bufferSize < 0) return HOSTSIM_STATUS_BAD_ARGUMENT;
    const Consultation consulted = ProfileStore::instance().consult({Operation::Get, node, lastParamText(params)});
    if (!consulted.profile) return HOSTSIM_STATUS_NO_PROFILE;
    if (consulted.fault) return HOSTSIM_STATUS_INJECTED;
    const NodeDefinition *definition = findNode(node);
    if (definition == nullptr || definition->recordSize == 0) return HOSTSIM_STATUS_UNKNOWN_NODE;
    if (std::size_t(bufferSize) != definition->recordSize) return HOSTSIM_STATUS_BAD_SIZE;
    // Built aside, so a failing read leaves the caller's buffer untouched.
    std::vector<unsigned char> record(definition->recordSize);
    const int status = definition->read(*consulted.profile, params, record.data());
    if (status == HOSTSIM_STATUS_OK) std::memcpy(buffer, record.data(), record.size());
    return status;
}
