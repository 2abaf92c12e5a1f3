// What every fuzz target needs of its input: the bytes as text, or copied
// into a zeroed record of a decoder's fixed size (the excess is dropped).
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <string>

namespace tvxfuzz {

inline std::string textOf(const std::uint8_t *data, std::size_t size) {
    return std::string(reinterpret_cast<const char *>(data), size);
}

template <typename Record>
void fillRecord(Record &record, const std::uint8_t *data, std::size_t size) {
    std::memset(&record, 0, sizeof record);
    std::memcpy(&record, data, size < sizeof record ? size : sizeof record);
}

// What `decode` makes of the input as a record of `width` bytes.
template <std::size_t width, typename Details, typename Decode>
Details decodeRecord(const std::uint8_t *data, std::size_t size, Decode decode) {
    unsigned char record[width];
    fillRecord(record, data, size);
    Details details{};
    decode(record, details);
    return details;
}

// A decoded text field must end within its array: the providers hand it on
// as a C string.
template <std::size_t width>
void requireTerminated(const char (&field)[width]) {
    if (std::memchr(field, '\0', width) == nullptr) std::abort();
}

}  // namespace tvxfuzz
