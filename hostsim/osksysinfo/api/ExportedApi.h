// The library's exported functions: everything else is hidden, so the
// declarations they are defined against get default visibility here.
#pragma once

#pragma GCC visibility push(default)
#include "hostsim/HostSimControl.h"
#include "platform/OskSysInfo.h"
#pragma GCC visibility pop
