// The identity text of a version record: the InstanceID of its
// Talvex_HypervisorSoftwareIdentity, and what tells the alternate image
// apart for the installed-software association.
#pragma once

#include <string>

#include "software/SystemVersionInfo.h"

namespace Software {

constexpr const char *hypervisorIdentityClass = "Talvex_HypervisorSoftwareIdentity";
constexpr const char *altBootBankPrefix = "Alt Boot Bank:";

// "[Alt Boot Bank: ]<product> <version> build-<build as unsigned 32-bit>"
std::string makeInstanceId(const SystemVersionInfo &record);

// True when the InstanceID names the image in the alternate boot bank.
bool isAltBootBankId(const char *instanceId);

// A record's text field as a string, up to its terminator or its end.
template <std::size_t width>
std::string fieldText(const char (&field)[width]) {
    std::size_t length = 0;
    while (length < width && field[length] != '\0') ++length;
    return std::string(field, length);
}

}  // namespace Software
