// Writing node records byte by byte: little-endian numbers of any width, and
// texts that fill their field without a terminator when long enough.
#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string>

namespace hostsim {

inline void putUnsigned(unsigned char *at, std::uint64_t value, std::size_t width) {
    for (std::size_t i = 0; i < width; ++i) at[i] = static_cast<unsigned char>(value >> (8 * i));
}

// The field must be zeroed: a shorter text relies on it for its terminator.
inline void putText(unsigned char *at, std::size_t width, const std::string &text) {
    std::memcpy(at, text.data(), std::min(width, text.size()));
}

}  // namespace hostsim
