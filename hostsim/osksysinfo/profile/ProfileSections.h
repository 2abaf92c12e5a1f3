// The readers of the top-level profile sections, one file each; each takes
// its field from the top-level object and fills its part of the profile.
#pragma once

#include "profile/HostProfile.h"
#include "profile/JsonObjectReader.h"

namespace hostsim {

void readAdapters(JsonObjectReader &host, HostProfile &profile);
void readProcessors(JsonObjectReader &host, HostProfile &profile);
void readInterfaces(JsonObjectReader &host, HostProfile &profile);
void readSystemVersion(JsonObjectReader &host, HostProfile &profile);
void readFaults(JsonObjectReader &host, HostProfile &profile);
void readWatchedElements(JsonObjectReader &host, HostProfile &profile);

}  // namespace hostsim
