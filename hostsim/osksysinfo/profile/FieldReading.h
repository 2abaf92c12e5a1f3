// Reading an optional field straight into the profile member it sets, within
// the member type's range; an absent field leaves the member's default.
#pragma once

#include <cstddef>
#include <limits>
#include <optional>
#include <string>
#include <utility>

#include "profile/JsonObjectReader.h"

namespace hostsim {

template <typename Number>
void readNumber(JsonObjectReader &object, const char *key, Number &into) {
    if (const auto value = object.unsignedInteger(key, 0, std::numeric_limits<Number>::max())) {
        into = static_cast<Number>(*value);
    }
}

// true, false or a number: the byte or word a flag is served as.
template <typename Number>
void readFlag(JsonObjectReader &object, const char *key, Number &into) {
    if (const auto value = object.flag(key, std::numeric_limits<Number>::max())) into = static_cast<Number>(*value);
}

inline void readText(JsonObjectReader &object, const char *key, std::string &into) {
    if (auto value = object.text(key)) into = std::move(*value);
}

// The name of an instance-list entry. Bounded, because a list call hands
// out every name of the list at once.
constexpr std::size_t longestInstanceName = 255;

inline std::optional<std::string> readInstanceName(JsonObjectReader &object, const char *key) {
    std::optional<std::string> name = object.text(key);
    if (name && name->size() > longestInstanceName) {
        object.fail(key, "expected a text of at most " + std::to_string(longestInstanceName) + " bytes, got " +
                             std::to_string(name->size()));
    }
    return name;
}

}  // namespace hostsim
