// The running hypervisor image the user library's version query reports.
#pragma once

#include <cstdint>
#include <string>

namespace hostsim {

struct SystemVersionProfile {
    std::string productName;  // empty until read: the host type decides the default
    std::string versionText = "5.1.0";
    std::string infoText = "releasebuild-1483097";
    std::string releaseDate = "Jul 12 2012";
    std::int32_t buildNumber = 1483097;
};

}  // namespace hostsim
