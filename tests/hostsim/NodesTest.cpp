// The records and instance lists the nodes serve, byte for byte where the
// providers decode them, and the requests they refuse.
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

// Offset and bytes of each field of a record.
using Fields = std::vector<std::pair<std::size_t, Bytes>>;

// Each field holds its bytes, and every byte of no field is zero.
void expectRecord(int node, const std::vector<Param> &params, std::size_t size, const Fields &fields) {
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

// A stem ending in a digit, so a name can be split more than one way.
const nlohmann::json interfaces = nlohmann::json::array({
    {{"name", "probe"}, {"ipv4Address", "192.168.10.21"}, {"ipv4Netmask", "255.255.255.0"},
     {"ipv6", {{{"address", "fe80::1"}},
               {{"instance", "b"}, {"address", alphabet}, {"prefixLength", "0x11223344"}},
               {{"address", alphabet.substr(0, 48)}, {"prefixLength", 0}}}}},
    {{"name", "v6only"}, {"ipv6", {{{"address", "2001:db8::5"}, {"prefixLength", 48}}}}},
    {{"name", "vmk1"}, {"count", 11}, {"ipv4Address", "10.0.0.1"}},
});

using HostSimNodes = HostSimTest;

// Texts: a short one zero-padded, one exactly as wide as its field, and
// longer ones cut to their field without a terminator, the MAC at the very
// end of the record. The adapter decoder has no other oracle for the layout.
TEST_F(HostSimNodes, AdapterRecordCarriesEveryFieldAtItsOffset) {
    serve(host({{{"name", "probe"}, {"driverName", "ixgbe"}, {"driverVersion", alphabet.substr(0, 32)},
                 {"firmwareVersion", alphabet.substr(0, 40)}, {"interfaceName", alphabet.substr(0, 33)},
                 {"capabilities", 0x11223344}, {"enabledCapabilities", "0x55667788"}, {"pciBus", 0x01020304},
                 {"pciSlot", "0x0A0B0C0D"}, {"pciFunction", 7}, {"pciVendorId", "0x8086"}, {"pciDeviceId", 0x10fb},
                 {"linkUp", 2}, {"speedMbps", 10000}, {"fullDuplex", true}, {"mac", alphabet}},
                {{"name", "vmnic"}, {"count", 2}}}));
    EXPECT_EQ(servedAdapterNames(), (std::vector<std::string>{"probe", "vmnic0", "vmnic1"}));
    expectRecord(72, {"probe"}, 1252,
                 {{0, textField("ixgbe", 32)}, {32, textField(alphabet, 32)}, {64, textField(alphabet, 32)},
                  {128, textField(alphabet, 32)}, {160, word(0x11223344)}, {164, word(0x55667788)},
                  {172, word(0x01020304)}, {176, word(0x0A0B0C0D)}, {180, word(7)}, {184, {0x86, 0x80}},
                  {186, {0xfb, 0x10}}, {189, {2}}, {190, {0x10, 0x27}}, {192, {1}}, {1225, textField(alphabet, 27)}});
}

// The processor decoders have their own byte-level tests, and the
// inventory's tests read these records through them; here the registers
// those profiles leave out and the texts cut to their fields.
TEST_F(HostSimNodes, ProcessorRecordsCarryEveryRegisterAndCutTheirTexts) {
    const nlohmann::json cpuid = {{"vendor", "GenuineIntel"},  {"stepping", 255},
                                  {"leaf1Ebx", 0x11223344},    {"leaf1Ecx", "0x55667788"},
                                  {"extendedEcx", "0x99AABBCC"}, {"extendedEdx", 0xDDEEFF00}};
    serve(host({}, {},
               {{"hardwareThreads", "0xdeadbeef"}, {"modelText", alphabet}, {"powerPolicy", std::string(600, 'p')},
                {"packages", {{{"cpuid", cpuid}, {"cores", {{{"instance", 100}}}}}}}}));
    expectRecord(607, {std::int64_t{100}}, 200,
                 {{3, {255}}, {48, word(0x756E6547)}, {52, word(0x6C65746E)}, {56, word(0x49656E69)},
                  {64, word(0x11223344)}, {68, word(0x55667788)}, {100, word(0x99AABBCC)}, {104, word(0xDDEEFF00)}});
    expectRecord(605, {}, 36, {{0, word(0xdeadbeef)}});
    expectRecord(606, {}, 48, {{0, textField(alphabet, 48)}});
    expectRecord(1443, {}, 588, {{8, Bytes(580, 'p')}});
    serve(host({}));
    for (const auto &[node, size] : {std::pair{605, 36}, {606, 48}, {1443, 588}}) expectRecord(node, {}, size, {});
}

// Counted interfaces share their entry's addresses and are found by their
// computed names; the IPv6 record carries the address text as the adapter
// record carries its texts.
TEST_F(HostSimNodes, InterfaceNodesServeListsAndRecords) {
    serve({{"hostType", "Corlai"}, {"ipInterfaces", interfaces}});
    std::vector<std::string> names = {"probe", "v6only"};
    for (int n = 0; n < 11; ++n) names.push_back("vmk1" + std::to_string(n));
    EXPECT_EQ(listedNames(214), names);
    EXPECT_EQ(listedNames(243, {"probe"}), (std::vector<std::string>{"0", "b", "2"}));
    EXPECT_EQ(listedNames(243, {"v6only"}), std::vector<std::string>{"0"});
    EXPECT_EQ(listedNames(243, {"vmk110"}), std::vector<std::string>{});
    expectRecord(239, {"probe"}, 4, {{0, {192, 168, 10, 21}}});
    expectRecord(240, {"probe"}, 4, {{0, {255, 255, 255, 0}}});
    expectRecord(239, {"vmk110"}, 4, {{0, {10, 0, 0, 1}}});
    expectRecord(240, {"vmk110"}, 4, {});
    expectRecord(244, {"probe", "0"}, 68, {{0, textField("fe80::1", 48)}, {48, word(64)}});
    expectRecord(244, {"probe", "b"}, 68, {{0, textField(alphabet, 48)}, {48, word(0x11223344)}});
    expectRecord(244, {"probe", "2"}, 68, {{0, textField(alphabet, 48)}});
    expectRecord(244, {"v6only", "0"}, 68, {{0, textField("2001:db8::5", 48)}, {48, word(48)}});
}

TEST_F(HostSimNodes, BadRequestsFailWithTheirStatusAndLeaveTheBufferAlone) {
    const std::tuple<const char *, int, std::vector<Param>, std::size_t, int> cases[] = {
        {"record one byte short", 72, {"vmnic0"}, 1251, HOSTSIM_STATUS_BAD_SIZE},
        {"state record one byte long", 799, {std::int64_t{0}}, 161, HOSTSIM_STATUS_BAD_SIZE},
        {"unknown node", 71, {"vmnic0"}, 4, HOSTSIM_STATUS_UNKNOWN_NODE},
        {"node without a value", 70, {}, 4, HOSTSIM_STATUS_UNKNOWN_NODE},
        {"unknown adapter", 72, {"vmnic9"}, 1252, HOSTSIM_STATUS_NOT_FOUND},
        {"unknown core", 607, {std::int64_t{4}}, 200, HOSTSIM_STATUS_NOT_FOUND},
        {"core beyond 32 bits", 799, {std::int64_t{1} << 32}, 160, HOSTSIM_STATUS_NOT_FOUND},
        {"two names", 74, {"vmnic0", "vmnic0"}, 4, HOSTSIM_STATUS_BAD_ARGUMENT},
        {"core named by text", 607, {"0"}, 200, HOSTSIM_STATUS_BAD_ARGUMENT},
        {"no core named", 800, {}, 76, HOSTSIM_STATUS_BAD_ARGUMENT},
        {"host-wide node with a parameter", 606, {std::int64_t{0}}, 48, HOSTSIM_STATUS_BAD_ARGUMENT},
        {"address of an interface without IPv4", 239, {"v6only"}, 4, HOSTSIM_STATUS_NOT_FOUND},
        {"netmask of an interface without IPv4", 240, {"v6only"}, 4, HOSTSIM_STATUS_NOT_FOUND},
        {"a name that only splits like a counted one", 239, {"vmk1"}, 4, HOSTSIM_STATUS_NOT_FOUND},
        {"past the count", 239, {"vmk111"}, 4, HOSTSIM_STATUS_NOT_FOUND},
        {"netmask one byte long", 240, {"probe"}, 5, HOSTSIM_STATUS_BAD_SIZE},
        {"IPv6 record one byte short", 244, {"probe", "0"}, 67, HOSTSIM_STATUS_BAD_SIZE},
        {"unknown IPv6 instance", 244, {"probe", "9"}, 68, HOSTSIM_STATUS_NOT_FOUND},
        {"IPv6 record of an unknown interface", 244, {"vmk9", "0"}, 68, HOSTSIM_STATUS_NOT_FOUND},
        {"IPv6 record named by the interface alone", 244, {"probe"}, 68, HOSTSIM_STATUS_BAD_ARGUMENT},
        {"IPv6 instance named by an integer", 244, {"probe", std::int64_t{0}}, 68, HOSTSIM_STATUS_BAD_ARGUMENT},
        {"IPv4 address asked with the instance too", 239, {"probe", "0"}, 4, HOSTSIM_STATUS_BAD_ARGUMENT},
        {"interface list as a value", 214, {}, 4, HOSTSIM_STATUS_UNKNOWN_NODE},
    };
    nlohmann::json profile = host({{{"name", "vmnic0"}}}, {}, {{"packages", {{{"cores", {{{"count", 4}}}}}}}});
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
        {"interface list with a parent", 214, {"probe"}, HOSTSIM_STATUS_BAD_ARGUMENT},
        {"IPv6 list without an interface", 243, {}, HOSTSIM_STATUS_BAD_ARGUMENT},
        {"IPv6 list of an unknown interface", 243, {"vmk9"}, HOSTSIM_STATUS_NOT_FOUND},
    };
    for (const auto &[what, node, params, status] : listCases) {
        const List parent = listOf(params);
        PRB_ParamList *list = nullptr;
        EXPECT_EQ(PRB_GetInstanceListAlloc(node, parent.get(), &list), status) << what;
        EXPECT_EQ(list, nullptr) << what;
    }
    int status = -1;
    char workArea[21];
    EXPECT_EQ(PRB_CheckSig(workArea, 20, &status), HOSTSIM_STATUS_BAD_ARGUMENT);
    EXPECT_EQ(PRB_CheckSig(workArea, 21, &status), HOSTSIM_STATUS_OK);
}

}  // namespace
}  // namespace hostsim_test
