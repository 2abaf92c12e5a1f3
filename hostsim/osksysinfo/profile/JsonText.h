// The JSON text of a host profile as a document.
#pragma once

#include <string>

#include <nlohmann/json.hpp>

namespace hostsim {

// Throws ProfileError "not valid JSON: line L, column C: <reason>" for text
// that does not parse, a number beyond a double included.
nlohmann::json parseJson(const std::string &text);

}  // namespace hostsim
