#include "kernelip/IPv6Record.h"

#include "frame/BoundedText.h"
#include "frame/LittleEndian.h"

namespace TVX {
namespace {

constexpr std::size_t addressWidth = 48;
constexpr std::size_t prefixLengthAt = 48;

}  // namespace

void decodeIPv6Record(const unsigned char (&record)[ipv6RecordSize], endpointDetails &endpoint) {
    frame::copyBounded(endpoint.ipv6Address, reinterpret_cast<const char *>(record), addressWidth);
    endpoint.ipv6PrefixLength = frame::littleEndian(record + prefixLengthAt, 4);
}

}  // namespace TVX
