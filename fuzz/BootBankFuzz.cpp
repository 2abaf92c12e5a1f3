// The alternate boot bank's boot configuration.
#include <memory>

#include "FuzzInput.h"
#include "software/BootBank.h"

namespace {

struct FileCloser {
    void operator()(std::FILE *file) const { std::fclose(file); }
};

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    std::string text = tvxfuzz::textOf(data, size);
    if (text.empty()) return 0;  // fmemopen refuses an empty buffer
    const std::unique_ptr<std::FILE, FileCloser> file(::fmemopen(text.data(), text.size(), "r"));
    if (!file) std::abort();
    const std::unique_ptr<SystemVersionInfo> record = Software::readBootBank(file.get());
    tvxfuzz::requireTerminated(record->versionText);
    tvxfuzz::requireTerminated(record->productName);
    return 0;
}
