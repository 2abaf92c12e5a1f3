// The profile served when TVX_HOST_PROFILE is unset: profiles/default.json,
// compiled in.
#pragma once

namespace hostsim {

const char *defaultProfileText();

}  // namespace hostsim
