// Reading a key that a provider compares as text.
#pragma once

#include <optional>
#include <string>

#include "CmpiObjectPath.h"

namespace frame {

// The key's text; nothing when the key is absent, null or not text, as
// such a key names nothing a provider serves.
std::optional<std::string> keyText(const CmpiObjectPath &path, const char *key);

}  // namespace frame
