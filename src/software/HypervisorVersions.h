// The version records of the two hypervisor images, refreshed before every
// request of the software identity provider: the running image's from the
// user library's version query, the alternate boot bank's from its boot
// configuration (only on a host that runs the Ostrakon kernel alone).
#pragma once

#include <memory>
#include <string>
#include <utility>

#include "software/SystemVersionInfo.h"

namespace Software {

// Stand-ins for a version query that failed.
constexpr const char *defaultVersionText = "5.1.0";
constexpr std::int32_t defaultBuildNumber = 1483097;  // build-1483097
// A failed query leaves nothing trustworthy in the record, so the running
// record is rebuilt from the defaults. Its infoText gets this text, so it
// still reads as the running image: an empty one is the mark of the boot
// bank's record. The release date stays empty (no ReleaseDate).
constexpr const char *unknownInfoText = "version query failed";

class HypervisorVersions {
public:
    explicit HypervisorVersions(std::string path) : bootBankPath(std::move(path)) {}

    // Logs a failing version query at LOG_ERR and goes on with the
    // defaults; an unreadable boot configuration keeps the record read last.
    void gatherVersions();

    const SystemVersionInfo &running() const { return runningVersion; }
    // Null until the boot configuration has been opened once.
    const SystemVersionInfo *altBootBank() const { return alternate.get(); }

private:
    void useDefaults(bool osk);

    SystemVersionInfo runningVersion{};
    std::unique_ptr<SystemVersionInfo> alternate;
    std::string bootBankPath;
};

}  // namespace Software
