// Turns a host profile's JSON text or file into a HostProfile; throws
// ProfileError with a one-line reason naming the offending field.
#pragma once

#include <string>

#include "profile/HostProfile.h"

namespace hostsim {

HostProfile parseProfile(const std::string &json);

// The reason starts with the path: "<path>: <reason>".
HostProfile readProfileFile(const std::string &path);

}  // namespace hostsim
