// The provider directory, registration and MOF files a consistency suite
// runs on, and the variables it sets, fixed when the suite is built
// (tvx_add_consistency_suite).
#pragma once

#include <string>
#include <vector>

namespace consistency {

inline const char *const kProviderDir = TVX_SUITE_PROVIDER_DIR;
inline const char *const kRegistration = TVX_SUITE_REGISTRATION;
inline const std::vector<std::string> kMofFiles = {TVX_SUITE_MOFS};
inline const std::vector<std::string> kEnvironment = {TVX_SUITE_ENVIRONMENT};  // NAME=value

}  // namespace consistency
