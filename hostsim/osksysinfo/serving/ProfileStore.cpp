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
        profile_ = std::make_shared<const HostProfile>(useDefault ? parseProfile(defaultProfileText())
                                                                  : readProfileFile(path));
        restartCounts();
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

std::uint64_t ProfileStore::matchedCalls(std::size_t rule) {
    const std::lock_guard<std::mutex> lock(mutex_);
    return rule < matchedCalls_.size() ? matchedCalls_[rule] : 0;
}

void ProfileStore::serve(HostProfile profile) {
    // After the swap `served` holds the old profile, freed once the lock is released.
    std::shared_ptr<const HostProfile> served = std::make_shared<const HostProfile>(std::move(profile));
    const std::lock_guard<std::mutex> lock(mutex_);
    profile_.swap(served);
    restartCounts();
    loaded_ = true;
}

void ProfileStore::reset() {
    std::shared_ptr<const HostProfile> released;  // freed after the lock is released
    const std::lock_guard<std::mutex> lock(mutex_);
    released = std::move(profile_);
    restartCounts();
    loaded_ = false;
}

void ProfileStore::restartCounts() {
    matchedCalls_.assign(profile_ ? profile_->faults.size() : 0, 0);
    enumerations_.assign(profile_ ? profile_->watchedElements.classCount() : 0, 0);
}

WatchedPoll ProfileStore::watchedPoll(const std::string &className, bool enumeration) {
    const std::lock_guard<std::mutex> lock(mutex_);
    loadIfNeeded();
    WatchedPoll result{profile_};
    if (!profile_) return result;
    const std::optional<std::size_t> classNumber = profile_->watchedElements.findClass(className);
    if (!classNumber) return result;
    result.elements = &profile_->watchedElements.elementsOf(*classNumber);
    std::uint64_t &enumerated = enumerations_[*classNumber];
    if (enumeration) {
        result.poll = enumerated++;
    } else {
        result.poll = enumerated == 0 ? 0 : enumerated - 1;
    }
    return result;
}

}  // namespace hostsim
