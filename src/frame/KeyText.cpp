#include "frame/KeyText.h"

namespace frame {

std::optional<std::string> keyText(const CmpiObjectPath &path, const char *key) {
    const CmpiData value = path.getKey(key);
    if (value.isNotFound() || value.isNullValue()) return std::nullopt;
    if (value.type() != CMPI_string && value.type() != CMPI_chars) return std::nullopt;
    const char *text = value;
    return text != nullptr ? std::optional<std::string>(text) : std::nullopt;
}

}  // namespace frame
