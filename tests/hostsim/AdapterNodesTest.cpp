#include "HostSimTesting.h"

namespace hostsim_test {
namespace {

class HostSimAdapterNodes : public HostSimTest {};

TEST_F(HostSimAdapterNodes, RecordCarriesEveryFieldAtItsOffsetAndZeroElsewhere) {
    serve(host({{{"name", "probe"}, {"driverName", "ixgbe"}, {"driverVersion", "3.7.13"},
                 {"firmwareVersion", "0x800004d8"}, {"interfaceName", "vmnic0"}, {"capabilities", 0x11223344},
                 {"enabledCapabilities", "0x55667788"}, {"pciBus", 0x01020304}, {"pciSlot", "0x0A0B0C0D"},
                 {"pciFunction", 7}, {"pciVendorId", "0x8086"}, {"pciDeviceId", 0x10fb}, {"linkUp", 2},
                 {"speedMbps", 10000}, {"fullDuplex", true}, {"mac", "02:11:22:aa:bb:cc"}}}));
    const Fields fields = {
        {0, textField("ixgbe", 32)},    {32, textField("3.7.13", 32)},   {64, textField("0x800004d8", 32)},
        {128, textField("vmnic0", 32)}, {160, {0x44, 0x33, 0x22, 0x11}}, {164, {0x88, 0x77, 0x66, 0x55}},
        {172, {4, 3, 2, 1}},            {176, {0x0d, 0x0c, 0x0b, 0x0a}}, {180, {7, 0, 0, 0}},
        {184, {0x86, 0x80}},            {186, {0xfb, 0x10}},             {189, {2}},
        {190, {0x10, 0x27}},            {192, {1}},                      {1225, textField("02:11:22:aa:bb:cc", 27)},
    };
    Bytes record(1252, 0xa5);
    ASSERT_EQ(readNode(72, {"probe"}, record), HOSTSIM_STATUS_OK);
    expectFieldsElseZero(record, fields);
}

TEST_F(HostSimAdapterNodes, LongTextsFillTheirFieldWithoutTerminator) {
    const std::string alphabet = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789";
    const std::tuple<const char *, std::size_t, std::size_t, std::size_t> cases[] = {
        {"driverName", 0, 32, 32},
        {"firmwareVersion", 64, 32, 40},
        {"interfaceName", 128, 32, 33},
        {"mac", 1225, 27, 60},
    };
    for (const auto &[key, offset, width, length] : cases) {
        const std::string text = alphabet.substr(0, length);
        serve(host({{{"name", "vmnic0"}, {key, text}}}));
        Bytes record(1252);
        ASSERT_EQ(readNode(72, {"vmnic0"}, record), HOSTSIM_STATUS_OK);
        const std::string field(record.begin() + offset, record.begin() + offset + width);
        EXPECT_EQ(field, text.substr(0, width)) << key;
        EXPECT_TRUE(offset + width == record.size() || record[offset + width] == 0) << key;
    }
}

TEST_F(HostSimAdapterNodes, InstancesInProfileOrderWithTheirMtu) {
    serve(host({{{"name", "vmnic9"}}, {{"name", "vmnic"}, {"count", 3}, {"mtu", "0xdeadbeef"}}}));
    EXPECT_EQ(servedAdapterNames(), (std::vector<std::string>{"vmnic9", "vmnic0", "vmnic1", "vmnic2"}));
    Bytes mtu(4);
    ASSERT_EQ(readNode(74, {"vmnic2"}, mtu), HOSTSIM_STATUS_OK);
    EXPECT_EQ(mtu, (Bytes{0xef, 0xbe, 0xad, 0xde}));
    ASSERT_EQ(readNode(74, {"vmnic9"}, mtu), HOSTSIM_STATUS_OK);
    EXPECT_EQ(mtu, (Bytes{0xdc, 0x05, 0, 0})) << "1500 when the profile gives none";
    serve(host({}));
    EXPECT_EQ(servedAdapterNames(), std::vector<std::string>{});
}

TEST_F(HostSimAdapterNodes, BadRequestsFailAndLeaveTheBufferAlone) {
    const std::tuple<const char *, int, std::vector<Param>, std::size_t, int> cases[] = {
        {"record one byte short", 72, {"vmnic0"}, 1251, HOSTSIM_STATUS_BAD_SIZE},
        {"MTU into 8 bytes", 74, {"vmnic0"}, 8, HOSTSIM_STATUS_BAD_SIZE},
        {"unknown node", 71, {"vmnic0"}, 4, HOSTSIM_STATUS_UNKNOWN_NODE},
        {"node without a value", 70, {}, 4, HOSTSIM_STATUS_UNKNOWN_NODE},
        {"unknown adapter", 72, {"vmnic9"}, 1252, HOSTSIM_STATUS_NOT_FOUND},
        {"two names", 74, {"vmnic0", "vmnic0"}, 4, HOSTSIM_STATUS_BAD_ARGUMENT},
    };
    serve(host({{{"name", "vmnic0"}}}));
    for (const auto &[what, node, params, size, status] : cases) {
        Bytes buffer(size, 0xa5);
        EXPECT_EQ(readNode(node, params, buffer), status) << what;
        EXPECT_EQ(buffer, Bytes(size, 0xa5)) << what;
    }
    int status = -1;
    EXPECT_EQ(instanceList(72, &status), nullptr);
    EXPECT_EQ(status, HOSTSIM_STATUS_UNKNOWN_NODE);
    char workArea[21];
    EXPECT_EQ(PRB_CheckSig(workArea, 20, &status), HOSTSIM_STATUS_BAD_ARGUMENT);
    EXPECT_EQ(PRB_CheckSig(workArea, 21, &status), HOSTSIM_STATUS_OK);
}

}  // namespace
}  // namespace hostsim_test
