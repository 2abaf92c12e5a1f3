// The node-244 record as the kernel may hand it over: a text that fills its
// field with no terminator, a prefix length beyond a byte, and bytes past
// the prefix that must not be read.
#include <algorithm>
#include <cstring>
#include <string>

#include <gtest/gtest.h>

#include "kernelip/IPv6Record.h"

namespace TVX {
namespace {

TEST(IPv6Record, AddressTextAndLittleEndianPrefix) {
    const struct {
        std::string text;
        unsigned char prefix[4];
        const char *address;
        uint32_t prefixLength;
    } cases[] = {
        {"fe80::250:56ff:fe6a:1b2c", {64, 0, 0, 0}, "fe80::250:56ff:fe6a:1b2c", 64},
        {"2001:db8::1", {0x78, 0x56, 0x34, 0x12}, "2001:db8::1", 0x12345678},
        {"2001:db8::2", {0x40, 0x01, 0, 0}, "2001:db8::2", 0x140},
        // Printable prefix bytes, so a text read past its field would show them.
        {std::string(48, 'f'), {'7', '8', 0, 0}, "ffffffffffffffffffffffffffffffffffffffffffffffff", 0x3837},
        {"", {0xff, 0xff, 0xff, 0xff}, "", 0xffffffff},
    };
    for (const auto &c : cases) {
        unsigned char record[ipv6RecordSize];
        std::memset(record, 'x', sizeof record);
        std::memset(record, 0, 48);
        std::memcpy(record, c.text.data(), std::min<std::size_t>(c.text.size(), 48));
        std::memcpy(record + 48, c.prefix, sizeof c.prefix);
        endpointDetails endpoint;
        std::memset(&endpoint, 0x5a, sizeof endpoint);
        decodeIPv6Record(record, endpoint);
        EXPECT_STREQ(endpoint.ipv6Address, c.address) << c.text;
        EXPECT_EQ(endpoint.ipv6PrefixLength, c.prefixLength) << c.text;
    }
}

}  // namespace
}  // namespace TVX
