// How nodes and fault rules read the parameter list of a call.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <variant>

#include "hostsim/HostSimControl.h"
#include "serving/ParamList.h"

namespace hostsim {

bool hasNoParams(const PRB_ParamList *list);

// A read of a host-wide node, which takes no parameters: `encode` writes the
// record.
template <typename Encode>
int readWithoutParams(const PRB_ParamList *params, Encode encode) {
    if (!hasNoParams(params)) return HOSTSIM_STATUS_BAD_ARGUMENT;
    encode();
    return HOSTSIM_STATUS_OK;
}

// Parameter `index` of a list of exactly `count` parameters when it is a
// `Value` (a text or an integer); null otherwise.
template <typename Value>
const Value *paramAt(const PRB_ParamList *list, std::size_t index, std::size_t count) {
    if (list == nullptr || list->entries.size() != count || index >= count) return nullptr;
    return std::get_if<Value>(&list->entries[index].value);
}

// The list's only parameter when it is a `Value`; null otherwise.
template <typename Value>
const Value *soleParam(const PRB_ParamList *list) {
    return paramAt<Value>(list, 0, 1);
}

// The last parameter as text, integers in decimal: the instance a call is
// about. Nothing for an absent or empty list.
std::optional<std::string> lastParamText(const PRB_ParamList *list);

}  // namespace hostsim
