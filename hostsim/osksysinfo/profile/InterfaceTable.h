// The kernel's IP interfaces in instance-list order, found by name in
// constant time. An entry with a count is kept once and its interfaces'
// names are computed, so memory grows with the number of interfaces but
// never with that number times the size of what they share.
#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "profile/InterfaceProfile.h"

namespace hostsim {

class InterfaceTable {
public:
    InterfaceTable() = default;
    // The index refers to the entries it owns, so it moves but never copies.
    InterfaceTable(InterfaceTable &&) = default;
    InterfaceTable &operator=(InterfaceTable &&) = default;
    InterfaceTable(const InterfaceTable &) = delete;
    InterfaceTable &operator=(const InterfaceTable &) = delete;

    // Adds the entry's interfaces, or nothing and returns the first of
    // their names that is already taken.
    std::optional<std::string> add(std::unique_ptr<const InterfaceProfile> entry);

    // The entry serving the interface of this name; null for none.
    const InterfaceProfile *find(std::string_view name) const;

    std::size_t size() const { return index_.size(); }

    // Calls `visit` with each interface's name, in order.
    template <typename Visit>
    void eachName(Visit visit) const {
        for (const auto &entry : entries_) {
            if (!entry->count) {
                visit(entry->name);
                continue;
            }
            for (std::uint32_t n = 0; n < *entry->count; ++n) visit(entry->name + std::to_string(n));
        }
    }

private:
    // A name as a stem and, for a counted entry's interface, its number;
    // hashed and compared as spelt, whatever the split.
    struct Name {
        std::string_view stem;
        std::optional<std::uint32_t> number;
    };
    struct NameHash {
        std::size_t operator()(const Name &name) const;
    };
    struct NameEqual {
        bool operator()(const Name &left, const Name &right) const;
    };

    std::vector<std::unique_ptr<const InterfaceProfile>> entries_;
    std::unordered_map<Name, const InterfaceProfile *, NameHash, NameEqual> index_;
};

}  // namespace hostsim
