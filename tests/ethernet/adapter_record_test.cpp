// The adapter record is read at fixed offsets, little-endian, with bounded
// texts; the MAC text and the ethtool reply are turned into CIM values.
#include <linux/ethtool.h>

#include <cstring>
#include <string>

#include <gtest/gtest.h>

#include "ethernet/AdapterRecord.h"
#include "ethernet/LinkSettings.h"

namespace EthernetProvider {
namespace {

struct Record {
    unsigned char bytes[adapterRecordSize] = {};

    void put(std::size_t offset, uint32_t value, std::size_t width) {
        for (std::size_t i = 0; i < width; ++i) bytes[offset + i] = uint8_t(value >> (8 * i));
    }
    // Writes exactly the text's bytes: a text as wide as its field has no terminator.
    void text(std::size_t offset, const std::string &value) {
        std::memcpy(bytes + offset, value.data(), value.size());
    }
    PnicDetails decode() const {
        PnicDetails details;
        std::memset(&details, 0xA5, sizeof details);
        decodeAdapterRecord(bytes, details);
        return details;
    }
};

TEST(AdapterRecord, NumbersComeFromTheirOffsetsAndWidths) {
    Record record;
    record.put(160, 0x80000801, 4);
    record.put(164, 0x00000800, 4);
    record.put(172, 0x16, 4);
    record.put(176, 0x3, 4);
    record.put(180, 0x1, 4);
    record.put(184, 0x8086, 2);
    record.put(186, 0x10fb, 2);
    record.put(188, 0xff, 1);  // the byte before the link state is not part of anything
    record.put(189, 1, 1);
    record.put(190, 10000, 2);
    record.put(192, 1, 1);
    const PnicDetails d = record.decode();
    EXPECT_EQ(d.capabilities, 0x80000801u);
    EXPECT_EQ(d.enabledCapabilities, 0x800u);
    EXPECT_EQ(d.pciBus, 0x16u);
    EXPECT_EQ(d.pciSlot, 3u);
    EXPECT_EQ(d.pciFunction, 1u);
    EXPECT_EQ(d.pciVendorId, 0x8086u);
    EXPECT_EQ(d.pciDeviceId, 0x10fbu);
    EXPECT_EQ(d.linkUp, 1);
    EXPECT_EQ(d.speedMbps, 10000u);
    EXPECT_EQ(d.fullDuplex, 1);
}

TEST(AdapterRecord, TextsKeepAtMostThirtyOneCharacters) {
    const std::string full32(32, 'd');
    const struct {
        std::size_t offset;
        std::string written;
        std::string kept;
    } cases[] = {
        {0, full32, full32.substr(0, 31)},
        {32, "1.2.3", "1.2.3"},
        {64, "fw 7.10", "fw 7.10"},
        {128, "", ""},
    };
    Record record;
    for (const auto &c : cases) record.text(c.offset, c.written);
    const PnicDetails d = record.decode();
    const char *decoded[] = {d.driverName, d.driverVersion, d.firmwareVersion, d.interfaceName};
    for (std::size_t i = 0; i < 4; ++i) EXPECT_EQ(decoded[i], cases[i].kept) << cases[i].offset;
}

TEST(AdapterRecord, MacTextAtTheEndOfTheRecord) {
    Record record;
    record.text(1225, "02:1b:21:0a:0b:0c");
    const PnicDetails d = record.decode();
    const uint8_t expected[6] = {0x02, 0x1b, 0x21, 0x0a, 0x0b, 0x0c};
    EXPECT_EQ(0, std::memcmp(d.macAddress, expected, 6));
}

TEST(MacAddress, ParsesPairsAndClearsWhatIsMissing) {
    const struct {
        const char *text;
        uint8_t bytes[6];
    } cases[] = {
        {"02:11:22:aa:bb:cc", {0x02, 0x11, 0x22, 0xAA, 0xBB, 0xCC}},
        {"02:11:22:AA:BB:CC", {0x02, 0x11, 0x22, 0xAA, 0xBB, 0xCC}},
        {"02:11:zz:aa:bb:cc", {0x02, 0x11, 0, 0, 0, 0}},
        {"", {0, 0, 0, 0, 0, 0}},
        {"not a mac", {0, 0, 0, 0, 0, 0}},
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

TEST(PortType, EveryKnownPortAndSpeed) {
    const struct {
        uint8_t port;
        uint16_t speed;
        uint32_t portType;
    } cases[] = {
        {PORT_TP, 10, 50},        {PORT_TP, 100, 52},       {PORT_TP, 1000, 53},
        {PORT_TP, 2500, 54},      {PORT_TP, 10000, 55},     {PORT_FIBRE, 100, 100},
        {PORT_FIBRE, 1000, 102},  {PORT_FIBRE, 10000, 105}, {PORT_FIBRE, 2500, 0},
        {PORT_FIBRE, 10, 0},      {PORT_TP, 40000, 0},      {PORT_AUI, 1000, 0},
        {PORT_DA, 10000, 0},      {PORT_TP, 0, 0},          {PORT_OTHER, 100, 0},
    };
    for (const auto &c : cases) {
        EXPECT_EQ(portTypeFor(c.port, c.speed), c.portType) << int(c.port) << "/" << c.speed;
    }
}

TEST(DriverDevicePath, FormedFromTheRequestName) {
    char path[256];
    formatDriverDevicePath(path, sizeof path, "vmnic0");
    EXPECT_STREQ(path, "/dev/char/oskdriver/vmnic0");
}

}  // namespace
}  // namespace EthernetProvider
