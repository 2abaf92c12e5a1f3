// The stand-in platform libraries' host profile text.
#include "FuzzInput.h"
#include "profile/ProfileError.h"
#include "profile/ProfileReader.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    try {
        hostsim::parseProfile(tvxfuzz::textOf(data, size));
    } catch (const hostsim::ProfileError &) {
    }
    return 0;
}
