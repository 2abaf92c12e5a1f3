// Kernel records are little-endian whatever the host.
#pragma once

#include <cstddef>
#include <cstdint>

namespace frame {

inline uint32_t littleEndian(const unsigned char *bytes, std::size_t width) {
    uint32_t value = 0;
    for (std::size_t i = width; i-- > 0;) value = (value << 8) | bytes[i];
    return value;
}

}  // namespace frame
