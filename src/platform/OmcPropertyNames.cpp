#include "platform/OmcPropertyNames.h"

namespace OMC {

PropertyNames::PropertyNames(const char **properties, const CmpiObjectPath &path) {
    for (const char **name = properties; name != nullptr && *name != nullptr; ++name) names.emplace_back(*name);
    for (unsigned int index = 0, count = path.getKeyCount(); index < count; ++index) {
        CmpiString name;
        path.getKey(index, &name);
        if (!name.isNull()) names.emplace_back(name.charPtr());
    }
    for (const std::string &name : names) pointers.push_back(name.c_str());
    pointers.push_back(nullptr);
}

}  // namespace OMC
