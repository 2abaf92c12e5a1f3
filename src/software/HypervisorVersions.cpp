#include "software/HypervisorVersions.h"

#include <syslog.h>

#include "frame/BoundedText.h"
#include "software/BootBank.h"

namespace Software {

void HypervisorVersions::useDefaults(bool osk) {
    runningVersion = SystemVersionInfo{};
    frame::copyBounded(runningVersion.productName, osk ? corlaiProductName : corlaProductName);
    frame::copyBounded(runningVersion.versionText, defaultVersionText);
    frame::copyBounded(runningVersion.infoText, unknownInfoText);
    runningVersion.buildNumber = defaultBuildNumber;
}

void HypervisorVersions::gatherVersions() {
    const int status = OskuserVersion_GetSystemVersion(&runningVersion);
    const bool osk = HostType_OSIsOSK() != 0;
    if (status != 0) {
        int errnoValue = 0;
        OskuserStatus_CodeToErrno(status, &errnoValue);
        char text[1024] = {};
        OskuserStatus_CodeToString(status, text, sizeof text, 0);
        text[sizeof text - 1] = '\0';
        syslog(LOG_ERR, "Got error from OskuserVersion_GetSystemVersion (%d): %s\n", errnoValue, text);
        useDefaults(osk);
    }
    if (HostType_OSIsOSK() == 0) return;
    if (std::unique_ptr<SystemVersionInfo> record = readBootBank(bootBankPath.c_str())) {
        alternate = std::move(record);
    }
}

}  // namespace Software
