#include "frame/BoundedText.h"

#include <cstring>

namespace frame {

void copyBounded(char *dest, std::size_t destSize, const char *text, std::size_t textLimit) {
    if (destSize == 0) return;
    std::size_t length = text == nullptr ? 0 : ::strnlen(text, textLimit);
    if (length > destSize - 1) length = destSize - 1;
    std::memcpy(dest, text, length);
    dest[length] = '\0';
}

}  // namespace frame
