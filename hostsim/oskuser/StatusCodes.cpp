// What a status of the stand-in means: the statuses of the control API's
// HostSimStatus, which the version query and its faults return.
#pragma GCC visibility push(default)
#include "platform/OskUser.h"
#pragma GCC visibility pop

#include <cerrno>
#include <cstdio>

#include "hostsim/HostSimControl.h"

namespace {

struct StatusMeaning {
    int status;
    int errnoValue;
    const char *text;
};

const StatusMeaning meanings[] = {
    {HOSTSIM_STATUS_OK, 0, "Success"},
    {HOSTSIM_STATUS_BAD_ARGUMENT, EINVAL, "Bad argument"},
    {HOSTSIM_STATUS_NO_PROFILE, ENODEV, "No host profile"},
    {HOSTSIM_STATUS_UNKNOWN_NODE, ENOENT, "Unknown node"},
    {HOSTSIM_STATUS_BAD_SIZE, EINVAL, "Bad buffer size"},
    {HOSTSIM_STATUS_NOT_FOUND, ENOENT, "Not found"},
    {HOSTSIM_STATUS_WRONG_TYPE, EINVAL, "Wrong parameter type"},
    {HOSTSIM_STATUS_INJECTED, EIO, "Failure injected by the host profile"},
};

// Any other status a profile's fault chose.
constexpr StatusMeaning unknown{0, EIO, nullptr};

const StatusMeaning &meaningOf(int status) {
    for (const StatusMeaning &meaning : meanings) {
        if (meaning.status == status) return meaning;
    }
    return unknown;
}

}  // namespace

int OskuserStatus_CodeToErrno(int status, int *errnoValue) {
    if (errnoValue == nullptr) return HOSTSIM_STATUS_BAD_ARGUMENT;
    *errnoValue = meaningOf(status).errnoValue;
    return HOSTSIM_STATUS_OK;
}

int OskuserStatus_CodeToString(int status, char *buffer, size_t bufferSize, int flags) {
    if (buffer == nullptr || bufferSize == 0 || flags != 0) return HOSTSIM_STATUS_BAD_ARGUMENT;
    const StatusMeaning &meaning = meaningOf(status);
    if (meaning.text != nullptr) {
        std::snprintf(buffer, bufferSize, "%s", meaning.text);
    } else {
        std::snprintf(buffer, bufferSize, "Unknown status %d", status);
    }
    return HOSTSIM_STATUS_OK;
}
