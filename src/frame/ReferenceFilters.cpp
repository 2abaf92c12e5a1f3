#include "frame/ReferenceFilters.h"

#include <strings.h>

#include "CmpiObjectPath.h"

namespace frame {

bool filterGiven(const char *filter) { return filter != nullptr && *filter != '\0'; }

bool roleFilterMisses(const char *filter, const char *role) {
    return filterGiven(filter) && ::strcasecmp(filter, role) != 0;
}

bool classFilterAccepts(const CmpiString &ns, const char *className, const char *filter) {
    return !filterGiven(filter) || CmpiObjectPath(ns, className).classPathIsA(filter);
}

}  // namespace frame
