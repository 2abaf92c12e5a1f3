#include <atomic>
#include <cstring>
#include <thread>

#include "HostSimTesting.h"

namespace hostsim_test {
namespace {

// An adapter inventory's and a health monitor's calls, tolerating a profile
// swapped underneath.
void walkHost() {
    char area[21];
    if (PRB_CheckSig(area, sizeof area, nullptr) != 0) return;
    for (const std::string &name : adapterNames()) {
        Bytes mtu(4), record(1252);
        readNode(74, {name}, mtu);
        readNode(72, {name}, record);
    }
    HostType_OSIsOSK();
    HostSimWatchedElements *watched = nullptr;
    if (HostSim_GetWatchedElements("CIM_Sensor", 1, &watched) != 0) return;
    // Read after the profile it came from may be gone: the copy must hold.
    std::size_t textBytes = 0;
    for (std::size_t i = 0; i < watched->count; ++i) textBytes += std::strlen(watched->elements[i].className);
    EXPECT_EQ(textBytes, watched->count * std::strlen("CIM_Sensor"));
    HostSim_FreeWatchedElements(watched);
}

using HostSimConcurrency = HostSimTest;

TEST_F(HostSimConcurrency, CallsFromManyThreadsWhileProfilesChange) {
    nlohmann::json sensors =
        host({{{"name", "vmnic"}, {"count", 8}}}, {{{"call", "PRB_Get"}, {"node", 72}, {"nth", 3}}});
    sensors["watchedElements"] = {{{"class", "CIM_Sensor"}, {"healthStates", {5, 10}}},
                                  {{"class", "CIM_Sensor"}, {"hostName", "esx1"}}};
    const std::string profiles[] = {
        sensors.dump(),
        nlohmann::json{{"hostType", "Corla"}, {"adapters", nlohmann::json::array({{{"name", "vmnic0"}}})}}.dump(),
    };
    std::atomic<bool> done{false};
    std::vector<std::thread> walkers;
    for (int t = 0; t < 4; ++t) {
        walkers.emplace_back([&done] {
            while (!done) walkHost();
        });
    }
    for (int swap = 0; swap < 50; ++swap) {
        EXPECT_EQ(loadError(profiles[swap % 2]), "");
        if (swap % 10 == 0) HostSim_ResetProfile();
        std::this_thread::yield();
    }
    done = true;
    for (std::thread &walker : walkers) walker.join();
}

}  // namespace
}  // namespace hostsim_test
