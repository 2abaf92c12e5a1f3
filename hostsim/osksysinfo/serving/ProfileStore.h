// The host profile being served, shared by every platform call and both
// libraries. It is loaded on first use from TVX_HOST_PROFILE (the built-in
// default when that is unset or empty); a profile that cannot be read is
// reported once on standard error and leaves the store without a profile.
#pragma once

#include <cstdint>
#include <memory>
#include <mutex>
#include <string>
#include <vector>

#include "profile/HostProfile.h"

namespace hostsim {

struct Consultation {
    std::shared_ptr<const HostProfile> profile;  // null: no profile could be read
    const FaultRule *fault = nullptr;            // the rule failing this call, if any
};

// A class's watched elements, and the poll whose HealthStates they carry.
struct WatchedPoll {
    std::shared_ptr<const HostProfile> profile;                    // null: no profile could be read
    const std::vector<WatchedElementProfile> *elements = nullptr;  // null: none of the class
    std::uint64_t poll = 0;
};

class ProfileStore {
public:
    static ProfileStore &instance();

    std::shared_ptr<const HostProfile> current();
    // The current profile, and the fault rule (if any) that fails this call;
    // counts the call against every rule it matches.
    Consultation consult(const Call &call);
    // Calls counted against the rule at `rule` since the profile was loaded.
    std::uint64_t matchedCalls(std::size_t rule);
    // The elements of the class. An enumeration is counted as the class's
    // next one and carries its poll; otherwise the last enumerated poll
    // (0 before any) is carried and nothing is counted.
    WatchedPoll watchedPoll(const std::string &className, bool enumeration);

    void serve(HostProfile profile);
    void reset();

private:
    void loadIfNeeded();
    // Every call and enumeration count starts again with the profile.
    void restartCounts();

    std::mutex mutex_;
    bool loaded_ = false;
    std::shared_ptr<const HostProfile> profile_;
    std::vector<std::uint64_t> matchedCalls_;  // per fault rule of profile_
    std::vector<std::uint64_t> enumerations_;  // per class of profile_'s watched elements
};

}  // namespace hostsim
