// The kernel's record of one IPv6 address (node 244).
#include "FuzzInput.h"
#include "kernelip/IPv6Record.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    using namespace TVX;
    const auto endpoint = tvxfuzz::decodeRecord<ipv6RecordSize, endpointDetails>(data, size, decodeIPv6Record);
    tvxfuzz::requireTerminated(endpoint.ipv6Address);
    return 0;
}
