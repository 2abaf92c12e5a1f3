// Property names as the null-terminated list CMPI takes, owning their text:
// the keys of a path, optionally after the names of a request's list.
#pragma once

#include <string>
#include <vector>

#include "CmpiObjectPath.h"

namespace OMC {

class PropertyNames {
public:
    // The names of `properties` (none when it is null), then those of the
    // keys of `path`.
    PropertyNames(const char **properties, const CmpiObjectPath &path);
    PropertyNames(const PropertyNames &) = delete;
    PropertyNames &operator=(const PropertyNames &) = delete;

    const char **list() { return pointers.data(); }

private:
    std::vector<std::string> names;
    std::vector<const char *> pointers;
};

}  // namespace OMC
