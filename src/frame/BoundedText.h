// Fixed-size text fields are filled by bounded copies that always terminate.
#pragma once

#include <cstddef>

namespace frame {

// Copies at most destSize - 1 characters of text, reading no more than
// textLimit bytes of it (the source may be a field without a terminator).
void copyBounded(char *dest, std::size_t destSize, const char *text, std::size_t textLimit);

template <std::size_t destSize>
void copyBounded(char (&dest)[destSize], const char *text, std::size_t textLimit = destSize) {
    copyBounded(dest, destSize, text, textLimit);
}

}  // namespace frame
