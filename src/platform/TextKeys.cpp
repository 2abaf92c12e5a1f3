#include "platform/TextKeys.h"

#include <algorithm>

#include "CmpiString.h"

namespace platform {

TextKeyList normalizedKeys(TextKeyList keys) {
    for (auto &key : keys) {
        for (char &c : key.first) {
            if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
        }
    }
    std::sort(keys.begin(), keys.end());
    return keys;
}

std::optional<TextKeyList> textKeysOf(const CmpiObjectPath &path, bool allText) {
    TextKeyList keys;
    for (unsigned int index = 0, count = path.getKeyCount(); index < count; ++index) {
        CmpiString name;
        const CmpiData value = path.getKey(index, &name);
        if (value.type() == CMPI_string && !value.isNullValue() && !value.isNotFound() && !name.isNull()) {
            keys.emplace_back(name.charPtr(), static_cast<const char *>(value));
        } else if (allText) {
            return std::nullopt;
        }
    }
    return normalizedKeys(std::move(keys));
}

}  // namespace platform
