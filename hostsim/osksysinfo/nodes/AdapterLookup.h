// The adapter an adapter node is asked about: its name is the call's only
// parameter.
#pragma once

#include "profile/HostProfile.h"
#include "serving/ParamList.h"

namespace hostsim {

// Returns a HostSimStatus; sets `adapter` on success.
int findNamedAdapter(const HostProfile &profile, const PRB_ParamList *params, const AdapterProfile *&adapter);

}  // namespace hostsim
