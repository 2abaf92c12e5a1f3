// Whether the system-information library can be used at all: every
// inventory asks this first.
#pragma once

#include "platform/OskSysInfo.h"

namespace platform {

inline bool systemInfoUsable() {
    char workArea[21] = {};
    int signatureWord = 0;  // the library's own; nothing reads it afterwards
    return PRB_CheckSig(workArea, sizeof workArea, &signatureWord) == 0;
}

}  // namespace platform
