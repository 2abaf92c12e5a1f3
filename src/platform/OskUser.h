// The Ostrakon user library: where the process runs, which host it is, and
// the version of the running hypervisor image.
#pragma once

#include <stddef.h>
#include <stdint.h>

extern "C" {

// The system-version record: 164 bytes, little-endian, every text
// NUL-terminated within its field.
struct SystemVersionInfo {
    char productName[32];
    char versionText[32];      // three dot-separated numbers, such as 5.1.0
    char infoText[32];         // filled by the platform for the running system
    char releaseDateText[64];  // month name, day and year: "Jul 12 2012"
    int32_t buildNumber;
};

// Sets *inCos non-zero when the process runs in the service console rather
// than directly on the Ostrakon kernel.
int OskuserCompat_InCOS(int *inCos);

// True on a host that runs the Ostrakon kernel alone, false on a host with a
// service console.
int HostType_OSIsOSK(void);

// Fills *info with the running image's version; returns 0, or a status the
// two functions below explain.
int OskuserVersion_GetSystemVersion(struct SystemVersionInfo *info);

// Sets *errnoValue to the errno value matching a status; returns 0.
int OskuserStatus_CodeToErrno(int status, int *errnoValue);

// Writes the text of a status into buffer (always terminated, cut to
// bufferSize); flags is 0. Returns 0.
int OskuserStatus_CodeToString(int status, char *buffer, size_t bufferSize, int flags);

}
