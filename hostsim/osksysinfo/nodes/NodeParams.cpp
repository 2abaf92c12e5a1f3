#include "nodes/NodeParams.h"

namespace hostsim {

bool hasNoParams(const PRB_ParamList *list) {
    return list == nullptr || list->entries.empty();
}

std::optional<std::string> lastParamText(const PRB_ParamList *list) {
    if (hasNoParams(list)) return std::nullopt;
    const auto &last = list->entries.back().value;
    if (const auto *text = std::get_if<std::string>(&last)) return *text;
    return std::to_string(std::get<std::int64_t>(last));
}

}  // namespace hostsim
