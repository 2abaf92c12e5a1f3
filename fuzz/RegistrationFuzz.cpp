// sfcb registration text as the broker reads it.
#include <stdexcept>

#include "FuzzInput.h"
#include "model/ProviderRegistration.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    try {
        tvxbroker::parseRegistration(tvxfuzz::textOf(data, size), "fuzz.reg");
    } catch (const std::runtime_error &) {
    }
    return 0;
}
