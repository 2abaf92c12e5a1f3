// The text keys of an object path in a form that compares as CIM compares
// them: names without regard to case, in any order, values exactly.
#pragma once

#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "CmpiObjectPath.h"

namespace platform {

using TextKeyList = std::vector<std::pair<std::string, std::string>>;

// Names in lower case, pairs sorted.
TextKeyList normalizedKeys(TextKeyList keys);

// The path's keys, normalized. A key that is not a non-null string is left
// out, or, when `allText` is asked for, makes the answer nothing.
std::optional<TextKeyList> textKeysOf(const CmpiObjectPath &path, bool allText);

}  // namespace platform
