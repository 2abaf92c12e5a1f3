// Instances kept in list order and found by their instance number in
// constant time, however many a profile serves.
#pragma once

#include <cstddef>
#include <cstdint>
#include <limits>
#include <unordered_map>
#include <vector>

namespace hostsim {

// `Instance` has a signed 32-bit member `instance`, its number.
template <typename Instance>
class InstanceTable {
public:
    // False, adding nothing, when the number is taken.
    bool add(const Instance &added) {
        if (!positions_.emplace(added.instance, instances_.size()).second) return false;
        instances_.push_back(added);
        return true;
    }

    // Null for a number no instance has, including any beyond 32 bits.
    const Instance *find(std::int64_t number) const {
        if (number < std::numeric_limits<std::int32_t>::min() || number > std::numeric_limits<std::int32_t>::max()) {
            return nullptr;
        }
        const auto found = positions_.find(static_cast<std::int32_t>(number));
        return found == positions_.end() ? nullptr : &instances_[found->second];
    }

    const std::vector<Instance> &inOrder() const { return instances_; }
    std::size_t size() const { return instances_.size(); }

private:
    std::vector<Instance> instances_;
    std::unordered_map<std::int32_t, std::size_t> positions_;  // instance number -> position
};

}  // namespace hostsim
