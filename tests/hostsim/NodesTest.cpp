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
    };
    serve(host({{{"name", "vmnic0"}}}, {}, {{"packages", {{{"cores", {{{"count", 4}}}}}}}}));
    for (const auto &[what, node, params, size, status] : cases) {
        Bytes buffer(size, 0xa5);
        EXPECT_EQ(readNode(node, params, buffer), status) << what;
        EXPECT_EQ(buffer, Bytes(size, 0xa5)) << what;
    }
    int status = -1;
    EXPECT_EQ(instanceList(72, &status), nullptr);
    EXPECT_EQ(status, HOSTSIM_STATUS_UNKNOWN_NODE);
    const List parent = listOf({std::int64_t{0}});
    PRB_ParamList *list = nullptr;
    EXPECT_EQ(PRB_GetInstanceListAlloc(607, parent.get(), &list), HOSTSIM_STATUS_BAD_ARGUMENT);
    EXPECT_EQ(list, nullptr);
    char workArea[21];
    EXPECT_EQ(PRB_CheckSig(workArea, 20, &status), HOSTSIM_STATUS_BAD_ARGUMENT);
    EXPECT_EQ(PRB_CheckSig(workArea, 21, &status), HOSTSIM_STATUS_OK);
}

}  // namespace
}  // namespace hostsim_test
