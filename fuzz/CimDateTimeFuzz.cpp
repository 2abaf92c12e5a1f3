// CIM datetime text. One that parses and can be written must read back as
// the same point or interval.
#include <stdexcept>

#include "FuzzInput.h"
#include "model/CimDateTime.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    tvxbroker::DateTime value;
    if (!tvxbroker::parseCimDateTime(tvxfuzz::textOf(data, size), value)) return 0;
    std::string text;
    try {
        text = tvxbroker::formatCimDateTime(value);
    } catch (const std::out_of_range &) {
        return 0;
    }
    tvxbroker::DateTime again;
    if (!tvxbroker::parseCimDateTime(text, again) || !(again == value)) std::abort();
    return 0;
}
