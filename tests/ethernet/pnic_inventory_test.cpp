// The adapter walk against the stand-in host: records in kernel order, every
// fault giving its result with the records read before it, the ethtool
// reply turned into port type and autonegotiation, and no list left alive.
#include <linux/ethtool.h>
#include <net/if.h>

#include <cstring>
#include <map>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "ethernet/EthtoolRequest.h"
#include "ethernet/GetPnicDetails.h"
#include "hostsim/HostSimControl.h"

namespace EthernetProvider {
namespace {

std::string adapter(const std::string &name, const std::string &extra = "") {
    return R"({"name": ")" + name + R"(", "driverName": "drv-)" + name +
           R"(", "mac": "02:00:00:00:00:01", "mtu": 1500)" + extra + "}";
}

std::string profile(const std::string &hostType, const std::vector<std::string> &adapters,
                    const std::string &faults = "") {
    std::string json = R"({"hostType": ")" + hostType + R"(", "adapters": [)";
    for (std::size_t i = 0; i < adapters.size(); ++i) json += (i ? "," : "") + adapters[i];
    return json + "], \"faults\": [" + faults + "]}";
}

void serve(const std::string &json) {
    char error[256];
    ASSERT_EQ(HostSim_LoadProfileText(json.c_str(), error, sizeof error), 0) << error;
}

struct Inventory {
    unsigned int result;
    std::vector<std::string> names;
};

Inventory inventory() {
    std::vector<PnicDetails> pnics;
    Inventory taken{getPnicDetails(pnics), {}};
    for (const PnicDetails &pnic : pnics) taken.names.push_back(pnic.name);
    return taken;
}

class PnicInventory : public testing::Test {
protected:
    void TearDown() override {
        EXPECT_EQ(HostSim_LiveListCount(), 0u) << "a list was not freed";
        HostSim_ResetProfile();
    }
};

TEST_F(PnicInventory, RecordsFollowTheKernelListWithTheirMtuAndName) {
    const std::string longName(130, 'n');
    serve(profile("Corlai", {adapter("vmnic3", R"(, "mtu": 9000)"), adapter("vmnic1"),
                             adapter(longName)}));
    std::vector<PnicDetails> pnics;
    ASSERT_EQ(getPnicDetails(pnics), 0u);
    ASSERT_EQ(pnics.size(), 3u);
    EXPECT_STREQ(pnics[0].name, "vmnic3");
    EXPECT_EQ(pnics[0].mtu, 9000u);
    EXPECT_STREQ(pnics[0].driverName, "drv-vmnic3");
    EXPECT_STREQ(pnics[1].name, "vmnic1");
    EXPECT_EQ(pnics[2].name, longName.substr(0, 127));
}

TEST_F(PnicInventory, EveryFaultEndsTheWalkAsItShould) {
    const std::vector<std::string> three = {adapter("vmnic0"), adapter("vmnic1"), adapter("vmnic2")};
    const struct {
        const char *fault;
        unsigned int result;
        std::vector<std::string> kept;
    } cases[] = {
        {R"({"call": "PRB_CheckSig"})", 1, {}},
        {R"({"call": "PRB_GetInstanceListAlloc", "node": 70})", 1, {}},
        {R"({"call": "PRB_ParamListGetString", "index": 1})", 1, {"vmnic0"}},
        {R"({"call": "PRB_ParamListCreate", "nth": 2})", 0, {"vmnic0"}},
        {R"({"call": "PRB_ParamListCreate", "nth": 1})", 0, {}},
        {R"({"call": "PRB_ParamListAddString", "text": "vmnic2"})", 1, {"vmnic0", "vmnic1"}},
        {R"({"call": "PRB_Get", "node": 74, "instance": "vmnic1"})", 1, {"vmnic0"}},
        {R"({"call": "PRB_Get", "node": 72, "instance": "vmnic2"})", 1, {"vmnic0", "vmnic1"}},
    };
    for (const auto &c : cases) {
        serve(profile("Corlai", three, c.fault));
        const Inventory taken = inventory();
        EXPECT_EQ(taken.result, c.result) << c.fault;
        EXPECT_EQ(taken.names, c.kept) << c.fault;
        EXPECT_EQ(HostSim_LiveListCount(), 0u) << c.fault;
    }
}

TEST_F(PnicInventory, EmptyHostIsASuccessWithNothing) {
    serve(profile("Corlai", {}));
    const Inventory taken = inventory();
    EXPECT_EQ(taken.result, 0u);
    EXPECT_TRUE(taken.names.empty());
}

// A driver that answers from a table, and remembers the names it was asked for.
struct ScriptedDriver {
    static std::map<std::string, ethtool_cmd> replies;
    static std::vector<std::string> asked;

    static int answer(int, ifreq *request) {
        asked.push_back(request->ifr_name);
        auto *command = reinterpret_cast<ethtool_cmd *>(request->ifr_data);
        EXPECT_EQ(command->cmd, uint32_t(ETHTOOL_GSET));
        const auto reply = replies.find(request->ifr_name);
        if (reply == replies.end()) return -1;
        *command = reply->second;
        return 0;
    }
};
std::map<std::string, ethtool_cmd> ScriptedDriver::replies;
std::vector<std::string> ScriptedDriver::asked;

ethtool_cmd reply(uint32_t supported, uint8_t port, uint16_t speed, uint16_t speedHi = 0) {
    ethtool_cmd cmd{};
    cmd.supported = supported;
    cmd.port = port;
    cmd.speed = speed;
    cmd.speed_hi = speedHi;
    return cmd;
}

class LinkSettingsFromDriver : public PnicInventory {
protected:
    void SetUp() override {
        ScriptedDriver::replies.clear();
        ScriptedDriver::asked.clear();
        previous = replaceEthtoolRequest(ScriptedDriver::answer);
    }
    void TearDown() override {
        replaceEthtoolRequest(previous);
        PnicInventory::TearDown();
    }
    EthtoolRequest previous = nullptr;
};

TEST_F(LinkSettingsFromDriver, ServiceConsoleAsksThroughASocket) {
    const std::string twentyChars = "vmnic_twenty_chars_x";
    ScriptedDriver::replies = {
        {"tp1000", reply(SUPPORTED_Autoneg, PORT_TP, 1000)},
        {"fibre1000", reply(0, PORT_FIBRE, 1000)},
        {"fibre2500", reply(SUPPORTED_Autoneg | SUPPORTED_TP, PORT_FIBRE, 2500)},
        {"highspeed", reply(0, PORT_TP, 1000, 1)},  // only the low speed bits count
        {twentyChars.substr(0, 15), reply(0, PORT_TP, 10000)},
    };
    serve(profile("Corla", {adapter("tp1000"), adapter("fibre1000"), adapter("fibre2500"),
                            adapter("highspeed"), adapter("silent"), adapter(twentyChars)}));
    std::vector<PnicDetails> pnics;
    ASSERT_EQ(getPnicDetails(pnics), 0u);
    const struct {
        uint32_t portType;
        uint8_t autoSense;
    } expected[] = {{53, 1}, {102, 0}, {0, 1}, {53, 0}, {0, 0}, {55, 0}};
    ASSERT_EQ(pnics.size(), 6u);
    for (std::size_t i = 0; i < pnics.size(); ++i) {
        EXPECT_EQ(pnics[i].portType, expected[i].portType) << pnics[i].name;
        EXPECT_EQ(pnics[i].autoSense, expected[i].autoSense) << pnics[i].name;
    }
    EXPECT_EQ(pnics[5].name, twentyChars);
    EXPECT_EQ(ScriptedDriver::asked.back(), twentyChars.substr(0, 15));
}

TEST_F(LinkSettingsFromDriver, WithoutTheDriverDeviceThePortIsStillListed) {
    ScriptedDriver::replies = {{"tvx-no-such-dev", reply(SUPPORTED_Autoneg, PORT_TP, 1000)}};
    serve(profile("Corlai", {adapter("tvx-no-such-dev")}));
    std::vector<PnicDetails> pnics;
    ASSERT_EQ(getPnicDetails(pnics), 0u);
    ASSERT_EQ(pnics.size(), 1u);
    EXPECT_EQ(pnics[0].portType, 0u);
    EXPECT_EQ(pnics[0].autoSense, 0);
    EXPECT_TRUE(ScriptedDriver::asked.empty());
}

}  // namespace
}  // namespace EthernetProvider
