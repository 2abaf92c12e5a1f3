#include "profile/InterfaceTable.h"

#include <charconv>

namespace hostsim {

namespace {

// A name's characters without building the string: the stem, then the
// number's decimal digits.
class Spelling {
public:
    Spelling(std::string_view stem, std::optional<std::uint32_t> number) : stem_(stem) {
        if (number) digitCount_ = std::size_t(std::to_chars(digits_, std::end(digits_), *number).ptr - digits_);
    }
    std::size_t size() const { return stem_.size() + digitCount_; }
    char operator[](std::size_t i) const { return i < stem_.size() ? stem_[i] : digits_[i - stem_.size()]; }

private:
    std::string_view stem_;
    char digits_[10] = {};
    std::size_t digitCount_ = 0;
};

}  // namespace

std::size_t InterfaceTable::NameHash::operator()(const Name &name) const {
    // FNV-1a, 64-bit.
    const Spelling spelling(name.stem, name.number);
    std::uint64_t hash = 14695981039346656037ull;
    for (std::size_t i = 0; i < spelling.size(); ++i) {
        hash = (hash ^ static_cast<unsigned char>(spelling[i])) * 1099511628211ull;
    }
    return std::size_t(hash);
}

bool InterfaceTable::NameEqual::operator()(const Name &left, const Name &right) const {
    const Spelling a(left.stem, left.number), b(right.stem, right.number);
    if (a.size() != b.size()) return false;
    for (std::size_t i = 0; i < a.size(); ++i) {
        if (a[i] != b[i]) return false;
    }
    return true;
}

std::optional<std::string> InterfaceTable::add(std::unique_ptr<const InterfaceProfile> entry) {
    const std::uint32_t count = entry->count.value_or(1);
    const auto nameOf = [&entry](std::uint32_t n) {
        return Name{entry->name, entry->count ? std::optional<std::uint32_t>(n) : std::nullopt};
    };
    for (std::uint32_t n = 0; n < count; ++n) {
        const Name name = nameOf(n);
        if (index_.count(name) != 0) {
            return std::string(name.stem) + (name.number ? std::to_string(*name.number) : std::string());
        }
    }
    index_.reserve(index_.size() + count);
    for (std::uint32_t n = 0; n < count; ++n) index_.emplace(nameOf(n), entry.get());
    entries_.push_back(std::move(entry));
    return std::nullopt;
}

const InterfaceProfile *InterfaceTable::find(std::string_view name) const {
    const auto found = index_.find(Name{name, std::nullopt});
    return found == index_.end() ? nullptr : found->second;
}

}  // namespace hostsim
