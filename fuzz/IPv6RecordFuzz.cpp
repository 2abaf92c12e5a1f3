// The kernel's record of one IPv6 address (node 244).
#include "FuzzInput.h"
#include "kernelip/IPv6Record.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    unsigned char record[TVX::ipv6RecordSize];
    tvxfuzz::fillRecord(record, data, size);
    TVX::endpointDetails endpoint{};
    TVX::decodeIPv6Record(record, endpoint);
    tvxfuzz::requireTerminated(endpoint.ipv6Address);
    return 0;
}
