#include "processor/HostProcessorSettings.h"

#include <strings.h>

#include <cstring>

#include "frame/LittleEndian.h"

namespace Processor {
namespace {

constexpr std::size_t policyNameAt = 8;

// isprint of the POSIX locale, whatever locale the broker runs in.
bool printable(unsigned char byte) { return byte >= 0x20 && byte <= 0x7E; }

bool startsWithIgnoringCase(const char *text, const char *prefix) {
    return ::strncasecmp(text, prefix, std::strlen(prefix)) == 0;
}

}  // namespace

void applyHostSettings(const HostProcessorSettings &host, ProcessorDetails &details) {
    static_assert(sizeof details.modelName == sizeof host.modelText, "the model text fills the name");
    std::memcpy(details.modelName, host.modelText, sizeof details.modelName);
    details.modelName[sizeof details.modelName - 1] = '\0';
    for (char *c = details.modelName; *c != '\0'; ++c) {
        if (!printable(static_cast<unsigned char>(*c))) *c = ' ';
    }

    details.hyperThreading = frame::littleEndian(host.hardwareThreads, 4) != 0 ? 1 : 0;

    // The name's field runs to the end of the record, so an unterminated
    // name still ends inside it for these short comparisons.
    const char *policy = reinterpret_cast<const char *>(host.powerPolicy + policyNameAt);
    if (startsWithIgnoringCase(policy, "off")) {
        details.powerManagement = 0;
        details.dynamicPower = 0;
    } else {
        details.powerManagement = 1;
        details.dynamicPower = startsWithIgnoringCase(policy, "dynamic") ? 1 : 0;
    }
}

}  // namespace Processor
