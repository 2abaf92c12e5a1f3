// The host profile being served, shared by every platform call and both
// libraries. It is loaded on first use from TVX_HOST_PROFILE (the built-in
// default when that is unset or empty); a profile that cannot be read is
// reported once on standard error and leaves the store without a profile.
#pragma once

#include <cstdint>
#include <memory>
#include <mutex>
#include <vector>

#include "profile/HostProfile.h"

namespace hostsim {

struct Consultation {
    std::shared_ptr<const HostProfile> profile;  // null: no profile could be read
    const FaultRule *fault = nullptr;            // the rule failing this call, if any
};

class ProfileStore {
public:
    static ProfileStore &instance();

    std::shared_ptr<const HostProfile> current();
    // The current profile, and the fault rule (if any) that fails this call;
    // counts the call against every rule it matches.
    Consultation consult(const Call &call);

    void serve(HostProfile profile);
    void reset();

private:
    void loadIfNeeded();

    std::mutex mutex_;
    bool loaded_ = false;
    std::shared_ptr<const HostProfile> profile_;
    std::vector<std::uint64_t> matchedCalls_;  // per fault rule of profile_
};

}  // namespace hostsim
