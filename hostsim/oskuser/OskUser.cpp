// The user library's host questions, answered from the profile that
// libosksysinfo serves, so both libraries describe the same host.
#pragma GCC visibility push(default)
#include "platform/OskUser.h"
#pragma GCC visibility pop

#include "hostsim/HostSimControl.h"

int OskuserCompat_InCOS(int *inCos) {
    return HostSim_HasServiceConsole(inCos);
}

int HostType_OSIsOSK(void) {
    int hasConsole = 0;
    HostSim_HasServiceConsole(&hasConsole);
    return hasConsole ? 0 : 1;
}

int OskuserVersion_GetSystemVersion(struct SystemVersionInfo *info) {
    return HostSim_GetSystemVersion(info);
}
