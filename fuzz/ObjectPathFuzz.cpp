// Object-path text as tvxcim reads it. A path that parses must format to
// text that parses back to the same path.
#include "FuzzInput.h"
#include "model/PathText.h"

namespace {

const char *const schemaMof = R"(
class Fuzz_Base { [Key] string Id; };
class Fuzz_Keys : Fuzz_Base {
    [Key] boolean Flag; [Key] uint8 Small; [Key] sint64 Big; [Key] char16 Letter;
    [Key] datetime When; [Key] Fuzz_Base REF Other; string Plain; uint16 List[];
};
)";

const tvxbroker::ClassSchema &schema() {
    static const tvxbroker::ClassSchema loaded = [] {
        tvxbroker::ClassSchema fresh;
        fresh.loadText(schemaMof, "fuzz schema");
        return fresh;
    }();
    return loaded;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    tvxbroker::ObjectPath path;
    try {
        path = tvxbroker::parsePath(tvxfuzz::textOf(data, size), schema());
    } catch (const tvxbroker::PathParseError &) {
        return 0;
    }
    if (!(tvxbroker::parsePath(tvxbroker::formatPath(path), schema()) == path)) std::abort();
    return 0;
}
