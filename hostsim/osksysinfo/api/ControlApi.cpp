// The control API: choosing the served profile, its fault counts, and the list counts.
#include <cstdio>
#include <cstring>
#include <exception>
#include <string>

#include "api/ExportedApi.h"
#include "platform/OskUser.h"
#include "profile/DefaultProfile.h"
#include "profile/ProfileReader.h"
#include "serving/ListRegistry.h"
#include "serving/ProfileStore.h"

using namespace hostsim;

namespace {

void report(const char *reason, char *error, size_t errorSize) {
    if (error != nullptr && errorSize > 0) std::snprintf(error, errorSize, "%s", reason);
}

int refuse(const char *reason, char *error, size_t errorSize) {
    report(reason, error, errorSize);
    return 1;
}

// Runs `read` and reports its failure: 0 on success, 1 otherwise.
template <typename Read>
int attempt(Read read, char *error, size_t errorSize) {
    try {
        read();
        report("", error, errorSize);
        return 0;
    } catch (const std::exception &failure) {
        return refuse(failure.what(), error, errorSize);
    }
}

}  // namespace

int HostSim_LoadProfileText(const char *json, char *error, size_t errorSize) {
    if (json == nullptr) return refuse("no profile text", error, errorSize);
    return attempt([json] { ProfileStore::instance().serve(parseProfile(json)); }, error, errorSize);
}

int HostSim_LoadProfileFile(const char *path, char *error, size_t errorSize) {
    if (path == nullptr) return refuse("no profile path", error, errorSize);
    return attempt([path] { ProfileStore::instance().serve(readProfileFile(path)); }, error, errorSize);
}

int HostSim_CheckProfileFile(const char *path, char *error, size_t errorSize) {
    if (path == nullptr) return refuse("no profile path", error, errorSize);
    return attempt([path] { readProfileFile(path); }, error, errorSize);
}

void HostSim_ResetProfile(void) {
    ProfileStore::instance().reset();
}

uint64_t HostSim_FaultMatchCount(size_t rule) {
    return ProfileStore::instance().matchedCalls(rule);
}

const char *HostSim_DefaultProfileText(void) {
    return defaultProfileText();
}

int HostSim_HasServiceConsole(int *hasConsole) {
    if (hasConsole == nullptr) return HOSTSIM_STATUS_BAD_ARGUMENT;
    const std::shared_ptr<const HostProfile> profile = ProfileStore::instance().current();
    *hasConsole = profile && profile->serviceConsole ? 1 : 0;
    return profile ? HOSTSIM_STATUS_OK : HOSTSIM_STATUS_NO_PROFILE;
}

int HostSim_GetSystemVersion(struct SystemVersionInfo *info) {
    if (info == nullptr) return HOSTSIM_STATUS_BAD_ARGUMENT;
    const Consultation consulted = ProfileStore::instance().consult({Operation::GetSystemVersion, {}, {}});
    if (!consulted.profile) return HOSTSIM_STATUS_NO_PROFILE;
    if (consulted.fault) return consulted.fault->status;
    const SystemVersionProfile &version = consulted.profile->systemVersion;
    SystemVersionInfo record{};
    // The profile reader keeps every text shorter than its field.
    version.productName.copy(record.productName, sizeof record.productName - 1);
    version.versionText.copy(record.versionText, sizeof record.versionText - 1);
    version.infoText.copy(record.infoText, sizeof record.infoText - 1);
    version.releaseDate.copy(record.releaseDateText, sizeof record.releaseDateText - 1);
    record.buildNumber = version.buildNumber;
    std::memcpy(info, &record, sizeof record);
    return HOSTSIM_STATUS_OK;
}

size_t HostSim_LiveListCount(void) {
    const ListCounts counts = ListRegistry::instance().counts();
    return counts.created - counts.destroyed;
}

size_t HostSim_CreatedListCount(void) {
    return ListRegistry::instance().counts().created;
}

size_t HostSim_DestroyedListCount(void) {
    return ListRegistry::instance().counts().destroyed;
}

size_t HostSim_ForeignDestroyCount(void) {
    return ListRegistry::instance().counts().foreign;
}
