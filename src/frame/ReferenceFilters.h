// The filters of an association request as a provider applies them to
// answer less: a null or empty filter text means no filter.
#pragma once

#include "CmpiString.h"

namespace frame {

bool filterGiven(const char *filter);

// True when a role or result-role filter is given and names another role,
// letter case aside.
bool roleFilterMisses(const char *filter, const char *role);

// True when no class filter is given, or a path of `className` in `ns` is
// of that class or below it.
bool classFilterAccepts(const CmpiString &ns, const char *className, const char *filter);

}  // namespace frame
