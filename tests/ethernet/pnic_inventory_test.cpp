// The adapter walk against the stand-in host: records in kernel order with
// long names cut, the ethtool reply turned into port type and
// autonegotiation, and the driver's device outside the service console. The MAC text is the provider tests',
// a list that cannot be made the fault sweep's.
#include <linux/ethtool.h>
#include <net/if.h>

#include <map>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "ethernet/EthtoolRequest.h"
#include "ethernet/GetPnicDetails.h"
#include "ethernet/LinkSettings.h"
#include "hostsim/HostSimControl.h"

namespace EthernetProvider {
namespace {

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

    // The records of a host whose adapters have nothing but their names.
    static std::vector<PnicDetails> take(const std::string &hostType, const std::vector<std::string> &names) {
        std::string json = R"({"hostType": ")" + hostType + R"(", "adapters": [)";
        for (const std::string &name : names) json += R"({"name": ")" + name + R"("},)";
        json.back() = ']';
        char error[256];
        EXPECT_EQ(HostSim_LoadProfileText((json + "}").c_str(), error, sizeof error), 0) << error;
        std::vector<PnicDetails> pnics;
        EXPECT_EQ(getPnicDetails(pnics), 0u);
        return pnics;
    }

    EthtoolRequest previous = nullptr;
};

// Outside the service console the driver is reached through its device,
// which this machine does not have; what the port record then holds is
// compared in the provider tests. In it, the driver is asked by the first
// 15 characters of the name, and the record keeps 127.
TEST_F(PnicInventory, ServiceConsoleAsksTheDriverThroughASocket) {
    const std::string longName(130, 'n');
    driverReplies = {
        {"tp1000", reply(SUPPORTED_Autoneg, PORT_TP, 1000)},
        {"fibre1000", reply(0, PORT_FIBRE, 1000)},
        {"fibre2500", reply(SUPPORTED_Autoneg | SUPPORTED_TP, PORT_FIBRE, 2500)},
        {"highspeed", reply(0, PORT_TP, 1000, 1)},  // only the low speed bits count
        {longName.substr(0, 15), reply(0, PORT_TP, 10000)},
    };
    take("Corlai", {"tp1000"});
    EXPECT_TRUE(askedNames.empty());
    const std::vector<PnicDetails> pnics =
        take("Corla", {"tp1000", "fibre1000", "fibre2500", "highspeed", "silent", longName});
    const struct {
        uint32_t portType;
        uint8_t autoSense;
    } expected[] = {{53, 1}, {102, 0}, {0, 1}, {53, 0}, {0, 0}, {55, 0}};
    ASSERT_EQ(pnics.size(), 6u);
    for (std::size_t i = 0; i < pnics.size(); ++i) {
        EXPECT_EQ(pnics[i].portType, expected[i].portType) << pnics[i].name;
        EXPECT_EQ(pnics[i].autoSense, expected[i].autoSense) << pnics[i].name;
    }
    EXPECT_EQ(pnics[5].name, longName.substr(0, 127));
    EXPECT_EQ(askedNames.back(), longName.substr(0, 15));
}

}  // namespace
}  // namespace EthernetProvider
