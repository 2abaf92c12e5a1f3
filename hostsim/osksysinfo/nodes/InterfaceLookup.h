// The kernel IP interface a node is asked about: its name is the call's
// first parameter.
#pragma once

#include <cstddef>

#include "profile/HostProfile.h"
#include "serving/ParamList.h"

namespace hostsim {

// `params` must hold `paramCount` parameters, the first a text. Returns a
// HostSimStatus; sets `interface` on success.
int findNamedInterface(const HostProfile &profile, const PRB_ParamList *params, std::size_t paramCount,
                       const InterfaceProfile *&interface);

}  // namespace hostsim
