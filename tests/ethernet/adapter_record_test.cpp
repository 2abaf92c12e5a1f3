// The MAC text of the adapter record keeps the pairs it can read. Every
// other field is seen, decoded from the stand-in's records, in the
// instances the provider tests compare.
#include <cstring>

#include <gtest/gtest.h>

#include "ethernet/AdapterRecord.h"

namespace EthernetProvider {
namespace {

TEST(MacAddress, ParsesPairsAndClearsWhatIsMissing) {
    const struct {
        const char *text;
        uint8_t bytes[6];
    } cases[] = {
        {"02:11:22:aa:BB:cc", {0x02, 0x11, 0x22, 0xAA, 0xBB, 0xCC}},
        {"02:11:zz:aa:bb:cc", {0x02, 0x11, 0, 0, 0, 0}},
        {"", {0, 0, 0, 0, 0, 0}},
        {"0211:22:aa:bb:cc", {0x02, 0, 0, 0, 0, 0}},
    };
    for (const auto &c : cases) {
        uint8_t mac[6];
        std::memset(mac, 0x5A, sizeof mac);
        parseMacAddress(c.text, std::strlen(c.text) + 1, mac);
        EXPECT_EQ(0, std::memcmp(mac, c.bytes, 6)) << c.text;
    }
    // A text filling its whole field is read no further than the field.
    const char unterminated[4] = {'0', '2', ':', '1'};
    uint8_t mac[6];
    parseMacAddress(unterminated, sizeof unterminated, mac);
    EXPECT_EQ(mac[0], 0x02);
    EXPECT_EQ(mac[1], 0x01);
}

}  // namespace
}  // namespace EthernetProvider
