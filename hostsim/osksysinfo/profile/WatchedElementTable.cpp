#include "profile/WatchedElementProfile.h"

#include <utility>

namespace hostsim {

void WatchedElementTable::add(WatchedElementProfile element) {
    const auto placed = classIndex_.emplace(caselessName(element.className), classes_.size());
    if (placed.second) classes_.emplace_back();
    classes_[placed.first->second].push_back(std::move(element));
    ++size_;
}

std::optional<std::size_t> WatchedElementTable::findClass(const std::string &className) const {
    const auto found = classIndex_.find(caselessName(className));
    if (found == classIndex_.end()) return std::nullopt;
    return found->second;
}

}  // namespace hostsim
