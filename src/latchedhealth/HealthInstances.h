// The instances and names the latched-health provider answers with.
#pragma once

#include "CmpiObjectPath.h"
#include "CmpiResult.h"
#include "latchedhealth/HealthInfo.h"

namespace TvLatchedHealth {

inline constexpr const char *kLatchedHealthClass = "Talvex_LatchedHealthState";
inline constexpr const char *kRollupHealthClass = "Talvex_RollupHealthState";
inline constexpr const char *kRollupName = "Talvex Rollup Health State";

// A record as an instance on the request's path, limited to `properties`.
void returnHealthInstance(const CmpiObjectPath &requestPath, const char **properties,
                          const HealthInfo &record, CmpiResult &result);
// A record's name: the request's namespace and class as written, and its
// event number.
void returnHealthName(const CmpiObjectPath &requestPath, const HealthInfo &record,
                      CmpiResult &result);

// The rollup on `path`, limited to `properties`, and its name.
void returnRollupInstance(const CmpiObjectPath &path, const char **properties, CmpiResult &result);
void returnRollupName(const CmpiObjectPath &requestPath, CmpiResult &result);

}  // namespace TvLatchedHealth
