// The records and instance lists the nodes serve, byte for byte where no
// decoder test pins the layout, and the requests they refuse. The processor
// and IP records are read through decoders whose own tests pin the offsets.
#include <algorithm>
#include <cstring>
#include <tuple>
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

// A stem ending in a digit, so a counted name can be split more than one way.
const nlohmann::json interfaces = nlohmann::json::array({
    {{"name", "probe"}, {"ipv4Address", "192.168.10.21"},
     {"ipv6", {{{"address", "fe80::1"}}, {{"instance", "b"}, {"address", alphabet}, {"prefixLength", "0x11223344"}}}}},
    {{"name", "vmk1"}, {"count", 11}, {"ipv4Address", "10.0.0.1"}},
});

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

// Counted interfaces share their entry's addresses and are found by their
// computed names; the IPv6 record cuts its address text as the adapter
// record cuts its texts.
TEST_F(HostSimNodes, InterfaceNodesServeListsAndRecords) {
    serve({{"hostType", "Corlai"}, {"ipInterfaces", interfaces}});
    std::vector<std::string> names = {"probe"};
    for (int n = 0; n < 11; ++n) names.push_back("vmk1" + std::to_string(n));
    EXPECT_EQ(listedNames(214), names);
    EXPECT_EQ(listedNames(243, {"probe"}), (std::vector<std::string>{"0", "b"}));
    EXPECT_EQ(listedNames(243, {"vmk110"}), std::vector<std::string>{});
    expectRecord(239, {"vmk110"}, 4, {{0, {10, 0, 0, 1}}});
    expectRecord(244, {"probe", "b"}, 68, {{0, textField(alphabet, 48)}, {48, word(0x11223344)}});
}

// The real library is this strict; a lenient stand-in would hide a provider
// that asks with the wrong size or parameters.
TEST_F(HostSimNodes, BadRequestsFailWithTheirStatusAndLeaveTheBufferAlone) {
    const std::tuple<const char *, int, std::vector<Param>, std::size_t, int> cases[] = {
        {"record one byte short", 72, {"vmnic0"}, 1251, HOSTSIM_STATUS_BAD_SIZE},
        {"record one byte long", 799, {std::int64_t{0}}, 161, HOSTSIM_STATUS_BAD_SIZE},
        {"unknown node", 71, {"vmnic0"}, 4, HOSTSIM_STATUS_UNKNOWN_NODE},
        {"unknown adapter", 72, {"vmnic9"}, 1252, HOSTSIM_STATUS_NOT_FOUND},
        {"core beyond 32 bits", 799, {std::int64_t{1} << 32}, 160, HOSTSIM_STATUS_NOT_FOUND},
        {"core named by text", 607, {"0"}, 200, HOSTSIM_STATUS_BAD_ARGUMENT},
        {"host-wide node with a parameter", 606, {std::int64_t{0}}, 48, HOSTSIM_STATUS_BAD_ARGUMENT},
        {"a name that only splits like a counted one", 239, {"vmk1"}, 4, HOSTSIM_STATUS_NOT_FOUND},
        {"IPv6 record named by the interface alone", 244, {"probe"}, 68, HOSTSIM_STATUS_BAD_ARGUMENT},
    };
    nlohmann::json profile = host({{{"name", "vmnic0"}}});
    profile["processors"] = {{"packages", {{{"cores", {{{"count", 4}}}}}}}};
    profile["ipInterfaces"] = interfaces;
    serve(profile);
    for (const auto &[what, node, params, size, status] : cases) {
        Bytes buffer(size, 0xa5);
        EXPECT_EQ(readNode(node, params, buffer), status) << what;
        EXPECT_EQ(buffer, Bytes(size, 0xa5)) << what;
    }
    const std::tuple<const char *, int, std::vector<Param>, int> listCases[] = {
        {"node without a list", 72, {}, HOSTSIM_STATUS_UNKNOWN_NODE},
        {"core list with a parent", 607, {std::int64_t{0}}, HOSTSIM_STATUS_BAD_ARGUMENT},
        {"IPv6 list of an unknown interface", 243, {"vmk9"}, HOSTSIM_STATUS_NOT_FOUND},
    };
    for (const auto &[what, node, parent, status] : listCases) {
        int got = -1;
        EXPECT_EQ(instanceList(node, parent, &got), nullptr) << what;
        EXPECT_EQ(got, status) << what;
    }
    char workArea[21];
    EXPECT_EQ(PRB_CheckSig(workArea, 20, nullptr), HOSTSIM_STATUS_BAD_ARGUMENT);
}

}  // namespace
}  // namespace hostsim_test
