// MOF text as the broker reads its class files.
#include <stdexcept>

#include "FuzzInput.h"
#include "model/ClassSchema.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    tvxbroker::ClassSchema schema;
    try {
        schema.loadText(tvxfuzz::textOf(data, size), "fuzz.mof");
    } catch (const std::runtime_error &) {
    }
    return 0;
}
