#include "serving/ProfileStore.h"

#include <cstdio>
#include <cstdlib>
#include <exception>
#include <string>

#include "profile/DefaultProfile.h"
#include "profile/ProfileReader.h"

namespace hostsim {

ProfileStore &ProfileStore::instance() {
    static ProfileStore store;
    return store;
}

void ProfileStore::loadIfNeeded() {
    if (loaded_) return;
    loaded_ = true;
    const char *path = std::getenv("TVX_HOST_PROFILE");
    const bool useDefault = path == nullptr || *path == '\0';
    try {
        auto profile = std::make_shared<const HostProfile>(useDefault ? parseProfile(defaultProfileText())
                                                                      : readProfileFile(path));
        matchedCalls_.assign(profile->faults.size(), 0);
        profile_ = std::move(profile);
    } catch (const std::exception &error) {
        const std::string origin = useDefault ? "built-in profile: " : "";
        std::fprintf(stderr, "hostsim: %s%s\n", origin.c_str(), error.what());
    }
}

std::shared_ptr<const HostProfile> ProfileStore::current() {
    const std::lock_guard<std::mutex> lock(mutex_);
    loadIfNeeded();
    return profile_;
}

Consultation ProfileStore::consult(const Call &call) {
    const std::lock_guard<std::mutex> lock(mutex_);
    loadIfNeeded();
    Consultation result{profile_};
    if (!profile_) return result;
    for (std::size_t i = 0; i < profile_->faults.size(); ++i) {
        const FaultRule &rule = profile_->faults[i];
        if (!rule.matches(call)) continue;
        const std::uint64_t nth = ++matchedCalls_[i];
        if (!result.fault && (rule.nth == 0 || rule.nth == nth)) result.fault = &rule;
    }
    return result;
}

void ProfileStore::serve(HostProfile profile) {
    // After the swap `served` holds the old profile, freed once the lock is released.
    std::shared_ptr<const HostProfile> served = std::make_shared<const HostProfile>(std::move(profile));
    const std::lock_guard<std::mutex> lock(mutex_);
    matchedCalls_.assign(served->faults.size(), 0);
    profile_.swap(served);
    loaded_ = true;
}

void ProfileStore::reset() {
    std::shared_ptr<const HostProfile> released;  // freed after the lock is released
    const std::lock_guard<std::mutex> lock(mutex_);
    released = std::move(profile_);
    matchedCalls_.clear();
    loaded_ = false;
}

}  // namespace hostsim
