// How nodes and fault rules read the parameter list of a call.
#pragma once

#include <optional>
#include <string>

#include "serving/ParamList.h"

namespace hostsim {

bool hasNoParams(const PRB_ParamList *list);

// The list's only parameter when it is a text; null otherwise.
const std::string *soleTextParam(const PRB_ParamList *list);

// The last parameter as text, integers in decimal: the instance a call is
// about. Nothing for an absent or empty list.
std::optional<std::string> lastParamText(const PRB_ParamList *list);

}  // namespace hostsim
