// The version record of the user library's system-version query, which the
// boot-bank reader fills in the same layout. The record is a contract with
// the platform library, so its layout is pinned here.
#pragma once

#include <cstddef>

#include "platform/OskUser.h"

static_assert(offsetof(SystemVersionInfo, productName) == 0, "productName at 0");
static_assert(offsetof(SystemVersionInfo, versionText) == 32, "versionText at 32");
static_assert(offsetof(SystemVersionInfo, infoText) == 64, "infoText at 64");
static_assert(offsetof(SystemVersionInfo, releaseDateText) == 96, "releaseDateText at 96");
static_assert(offsetof(SystemVersionInfo, buildNumber) == 160, "buildNumber at 160");
static_assert(sizeof(SystemVersionInfo) == 164, "the record is 164 bytes");

namespace Software {

// Product names: a host running the Ostrakon kernel alone, and one with a
// service console.
constexpr const char *corlaiProductName = "Talvex Corlai";
constexpr const char *corlaProductName = "Talvex Corla";

// The running image's record is the one whose infoText the platform filled;
// a boot-bank record leaves it empty.
inline bool isRunningImage(const SystemVersionInfo &record) { return record.infoText[0] != '\0'; }

}  // namespace Software
