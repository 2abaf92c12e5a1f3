// The adapter record byte for byte: no decoder test pins its layout. The
// processor and IP records are read through decoders whose own tests pin the
// offsets, and the kernel IP inventory's tests read the interface nodes.
#include <algorithm>
#include <cstring>
#include <utility>

#include "HostSimTesting.h"

namespace hostsim_test {
namespace {

const std::string alphabet = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789";

// A record field holding `text`: zero-padded, or cut to `width`.
Bytes textField(const std::string &text, std::size_t width) {
    Bytes bytes(width, 0);
    std::memcpy(bytes.data(), text.data(), std::min(width, text.size()));
    return bytes;
}

Bytes word(std::uint32_t value) {
    return {Bytes::value_type(value), Bytes::value_type(value >> 8), Bytes::value_type(value >> 16),
            Bytes::value_type(value >> 24)};
}

// Each field holds its bytes, and every byte of no field is zero.
void expectRecord(int node, const std::vector<Param> &params, std::size_t size,
                  const std::vector<std::pair<std::size_t, Bytes>> &fields) {
    Bytes record(size, 0xa5);
    ASSERT_EQ(readNode(node, params, record), HOSTSIM_STATUS_OK) << node;
    std::vector<bool> inField(size, false);
    for (const auto &[offset, bytes] : fields) {
        const auto field = record.begin() + offset;
        EXPECT_EQ(Bytes(field, field + bytes.size()), bytes) << node << "@" << offset;
        std::fill_n(inField.begin() + offset, bytes.size(), true);
    }
    for (std::size_t i = 0; i < size; ++i) EXPECT_TRUE(inField[i] || record[i] == 0) << node << ": byte " << i;
}

using HostSimNodes = HostSimTest;

// Texts: a short one zero-padded, longer ones cut to their field without a
// terminator, the MAC at the very end of the record. The adapter decoder has
// no other oracle for the layout.
TEST_F(HostSimNodes, AdapterRecordCarriesEveryFieldAtItsOffset) {
    serve(host({{{"name", "probe"}, {"driverName", "ixgbe"}, {"driverVersion", alphabet.substr(0, 32)},
                 {"firmwareVersion", alphabet.substr(0, 40)}, {"interfaceName", alphabet.substr(0, 33)},
                 {"capabilities", 0x11223344}, {"enabledCapabilities", "0x55667788"}, {"pciBus", 0x01020304},
                 {"pciSlot", "0x0A0B0C0D"}, {"pciFunction", 7}, {"pciVendorId", "0x8086"}, {"pciDeviceId", 0x10fb},
                 {"linkUp", 2}, {"speedMbps", 10000}, {"fullDuplex", true}, {"mac", alphabet}},
                {{"name", "vmnic"}, {"count", 2}}}));
    EXPECT_EQ(adapterNames(), (std::vector<std::string>{"probe", "vmnic0", "vmnic1"}));
    expectRecord(72, {"probe"}, 1252,
                 {{0, textField("ixgbe", 32)}, {32, textField(alphabet, 32)}, {64, textField(alphabet, 32)},
                  {128, textField(alphabet, 32)}, {160, word(0x11223344)}, {164, word(0x55667788)},
                  {172, word(0x01020304)}, {176, word(0x0A0B0C0D)}, {180, word(7)}, {184, {0x86, 0x80}},
                  {186, {0xfb, 0x10}}, {189, {2}}, {190, {0x10, 0x27}}, {192, {1}}, {1225, textField(alphabet, 27)}});
}

}  // namespace
}  // namespace hostsim_test
