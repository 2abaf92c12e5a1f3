// The adapter walk against the stand-in host: records in kernel order, the
// records a list that cannot be made leaves, the ethtool reply turned into
// port type and autonegotiation, the driver's device outside the service
// console, and the MAC text.
#include <linux/ethtool.h>
#include <net/if.h>

#include <cstring>
#include <map>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "ethernet/AdapterRecord.h"
#include "ethernet/EthtoolRequest.h"
#include "ethernet/GetPnicDetails.h"
#include "ethernet/LinkSettings.h"
#include "hostsim/HostSimControl.h"

namespace EthernetProvider {
namespace {

// A host whose adapters have nothing but their names.
std::string profile(const std::string &hostType, const std::vector<std::string> &names,
                    const std::string &faults = "") {
    std::string json = R"({"hostType": ")" + hostType + R"(", "faults": [)" + faults + R"(], "adapters": [)";
    for (const std::string &name : names) json += R"({"name": ")" + name + R"("},)";
    if (!names.empty()) json.pop_back();  // the comma after the last adapter
    return json + "]}";
}

// A driver that answers from a table, and remembers the names it was asked for.
std::map<std::string, ethtool_cmd> driverReplies;
std::vector<std::string> askedNames;

int scriptedDriver(int, ifreq *request) {
    askedNames.push_back(request->ifr_name);
    auto *command = reinterpret_cast<ethtool_cmd *>(request->ifr_data);
    EXPECT_EQ(command->cmd, uint32_t(ETHTOOL_GSET));
    const auto reply = driverReplies.find(request->ifr_name);
    if (reply == driverReplies.end()) return -1;
    *command = reply->second;
    return 0;
}

ethtool_cmd reply(uint32_t supported, uint8_t port, uint16_t speed, uint16_t speedHi = 0) {
    ethtool_cmd cmd{};
    cmd.supported = supported;
    cmd.port = port;
    cmd.speed = speed;
    cmd.speed_hi = speedHi;
    return cmd;
}

struct Inventory {
    unsigned int result;
    std::vector<PnicDetails> pnics;
    std::vector<std::string> names;
};

class PnicInventory : public testing::Test {
protected:
    void SetUp() override { previous = replaceEthtoolRequest(scriptedDriver); }
    void TearDown() override {
        replaceEthtoolRequest(previous);
        driverReplies.clear();
        askedNames.clear();
        EXPECT_EQ(HostSim_LiveListCount(), 0u) << "a list was not freed";
        HostSim_ResetProfile();
    }

    static Inventory take(const std::string &json) {
        char error[256];
        EXPECT_EQ(HostSim_LoadProfileText(json.c_str(), error, sizeof error), 0) << error;
        Inventory taken{};
        taken.result = getPnicDetails(taken.pnics);
        for (const PnicDetails &pnic : taken.pnics) taken.names.push_back(pnic.name);
        return taken;
    }

    EthtoolRequest previous = nullptr;
};

// Outside the service console the driver is reached through its device,
// which this machine does not have; what the port record then holds is
// compared in the provider tests.
TEST_F(PnicInventory, RecordsFollowTheKernelListWithLongNamesCut) {
    const std::string longName(130, 'n');
    driverReplies = {{"vmnic3", reply(SUPPORTED_Autoneg, PORT_TP, 1000)}};
    const Inventory taken = take(profile("Corlai", {"vmnic3", "vmnic1", longName}));
    EXPECT_EQ(taken.result, 0u);
    EXPECT_EQ(taken.names, (std::vector<std::string>{"vmnic3", "vmnic1", longName.substr(0, 127)}));
    EXPECT_TRUE(askedNames.empty());
}

// The one fault that answers a shorter inventory instead of an error: the
// walk ends where the list could not be made, keeping what came before.
TEST_F(PnicInventory, AListThatCannotBeMadeEndsTheWalkWithoutFailingIt) {
    const Inventory taken =
        take(profile("Corlai", {"vmnic0", "vmnic1", "vmnic2"}, R"({"call": "PRB_ParamListCreate", "nth": 2})"));
    EXPECT_EQ(taken.result, 0u);
    EXPECT_EQ(taken.names, std::vector<std::string>{"vmnic0"});
}

TEST_F(PnicInventory, ServiceConsoleAsksTheDriverThroughASocket) {
    const std::string twentyChars = "vmnic_twenty_chars_x";
    driverReplies = {
        {"tp1000", reply(SUPPORTED_Autoneg, PORT_TP, 1000)},
        {"fibre1000", reply(0, PORT_FIBRE, 1000)},
        {"fibre2500", reply(SUPPORTED_Autoneg | SUPPORTED_TP, PORT_FIBRE, 2500)},
        {"highspeed", reply(0, PORT_TP, 1000, 1)},  // only the low speed bits count
        {twentyChars.substr(0, 15), reply(0, PORT_TP, 10000)},
    };
    const Inventory taken =
        take(profile("Corla", {"tp1000", "fibre1000", "fibre2500", "highspeed", "silent", twentyChars}));
    ASSERT_EQ(taken.result, 0u);
    const struct {
        uint32_t portType;
        uint8_t autoSense;
    } expected[] = {{53, 1}, {102, 0}, {0, 1}, {53, 0}, {0, 0}, {55, 0}};
    ASSERT_EQ(taken.pnics.size(), 6u);
    for (std::size_t i = 0; i < taken.pnics.size(); ++i) {
        EXPECT_EQ(taken.pnics[i].portType, expected[i].portType) << taken.names[i];
        EXPECT_EQ(taken.pnics[i].autoSense, expected[i].autoSense) << taken.names[i];
    }
    EXPECT_EQ(taken.names[5], twentyChars);
    EXPECT_EQ(askedNames.back(), twentyChars.substr(0, 15));
}

// The MAC text of the adapter record keeps the pairs it can read.
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
