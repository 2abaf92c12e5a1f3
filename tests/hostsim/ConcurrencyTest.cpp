#include <atomic>
#include <thread>

#include "HostSimTesting.h"

namespace hostsim_test {
namespace {

// An adapter inventory's calls, tolerating a profile swapped underneath.
void walkAdapters() {
    char area[21];
    if (PRB_CheckSig(area, sizeof area, nullptr) != 0) return;
    for (const std::string &name : adapterNames()) {
        Bytes mtu(4), record(1252);
        readNode(74, {name}, mtu);
        readNode(72, {name}, record);
    }
    HostType_OSIsOSK();
}

using HostSimConcurrency = HostSimTest;

TEST_F(HostSimConcurrency, CallsFromManyThreadsWhileProfilesChange) {
    const std::string profiles[] = {
        host({{{"name", "vmnic"}, {"count", 8}}}, {{{"call", "PRB_Get"}, {"node", 72}, {"nth", 3}}}).dump(),
        nlohmann::json{{"hostType", "Corla"}, {"adapters", nlohmann::json::array({{{"name", "vmnic0"}}})}}.dump(),
    };
    std::atomic<bool> done{false};
    std::vector<std::thread> walkers;
    for (int t = 0; t < 4; ++t) {
        walkers.emplace_back([&done] {
            while (!done) walkAdapters();
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
