#include "HostSimTesting.h"

namespace hostsim_test {
namespace {

class HostSimAdapterNodes : public HostSimTest {};

// Texts: a short one zero-padded, one exactly as wide as its field, and
// longer ones cut to their field without a terminator, the MAC at the very
// end of the record.
TEST_F(HostSimAdapterNodes, RecordCarriesEveryFieldAtItsOffsetAndZeroElsewhere) {
    const std::string alphabet = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789";
    serve(host({{{"name", "probe"}, {"driverName", "ixgbe"}, {"driverVersion", alphabet.substr(0, 32)},
                 {"firmwareVersion", alphabet.substr(0, 40)}, {"interfaceName", alphabet.substr(0, 33)},
                 {"capabilities", 0x11223344}, {"enabledCapabilities", "0x55667788"}, {"pciBus", 0x01020304},
                 {"pciSlot", "0x0A0B0C0D"}, {"pciFunction", 7}, {"pciVendorId", "0x8086"}, {"pciDeviceId", 0x10fb},
                 {"linkUp", 2}, {"speedMbps", 10000}, {"fullDuplex", true}, {"mac", alphabet}}}));
    const Fields fields = {
        {0, textField("ixgbe", 32)},     {32, textField(alphabet, 32)},   {64, textField(alphabet, 32)},
        {128, textField(alphabet, 32)},  {160, {0x44, 0x33, 0x22, 0x11}}, {164, {0x88, 0x77, 0x66, 0x55}},
        {172, {4, 3, 2, 1}},             {176, {0x0d, 0x0c, 0x0b, 0x0a}}, {180, {7, 0, 0, 0}},
        {184, {0x86, 0x80}},             {186, {0xfb, 0x10}},             {189, {2}},
        {190, {0x10, 0x27}},             {192, {1}},                      {1225, textField(alphabet, 27)},
    };
    Bytes record(1252, 0xa5);
    ASSERT_EQ(readNode(72, {"probe"}, record), HOSTSIM_STATUS_OK);
    expectFieldsElseZero(record, fields);
}

TEST_F(HostSimAdapterNodes, InstancesInProfileOrderWithTheirMtu) {
    serve(host({{{"name", "vmnic9"}}, {{"name", "vmnic"}, {"count", 3}, {"mtu", "0xdeadbeef"}}}));
    EXPECT_EQ(servedAdapterNames(), (std::vector<std::string>{"vmnic9", "vmnic0", "vmnic1", "vmnic2"}));
    Bytes mtu(4);
    ASSERT_EQ(readNode(74, {"vmnic2"}, mtu), HOSTSIM_STATUS_OK);
    EXPECT_EQ(mtu, (Bytes{0xef, 0xbe, 0xad, 0xde}));
    ASSERT_EQ(readNode(74, {"vmnic9"}, mtu), HOSTSIM_STATUS_OK);
    EXPECT_EQ(mtu, (Bytes{0xdc, 0x05, 0, 0})) << "1500 when the profile gives none";
}

}  // namespace
}  // namespace hostsim_test
