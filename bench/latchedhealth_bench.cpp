// The health monitor's poll as its thread runs it, on hosts whose watched
// elements are all latched already: the stand-in host providers serve 100,
// 1,000 and 10,000 unhealthy elements through the embedded broker, and each
// poll finds every element's record. Prints the cost per element and how
// many times as much an element costs at 10,000 (goal: within 1.5 of 100).
// Then starts both latched-health threads through the shipped factories and
// prints how long a terminating cleanup takes while both wait (goal: under
// 10 ms).
#include <benchmark/benchmark.h>

#include <chrono>
#include <cstdio>
#include <string>
#include <thread>

#include "CmpiBroker.h"
#include "FigureKeepingReporter.h"
#include "core/Broker.h"
#include "hostsim/HostSimControl.h"
#include "latchedhealth/HealthMonitor.h"
#include "latchedhealth/LatchedHealthState.h"

extern "C" CMPIInstanceMI *Talvex_LatchedHealthState_Create_InstanceMI(CMPIBroker *, const CMPIContext *,
                                                                       CMPIStatus *);

namespace {

constexpr const char *kNs = "root/cimv2";

std::string hostWithUnhealthyElements(int count) {
    std::string profile = R"({"hostType": "Corlai", "watchedElements": [)";
    for (int i = 0; i < count; ++i) {
        const char *cls = TvLatchedHealth::watchedClasses[static_cast<std::size_t>(i) % 12].className;
        profile += std::string(i == 0 ? "" : ",") + R"({"class": ")" + cls +
                   R"(", "hostName": "esx1", "keys": [{"name": "CreationClassName", "value": ")" + cls +
                   R"("}, {"name": "DeviceID", "value": "e)" + std::to_string(count) + "-" + std::to_string(i) +
                   R"("}], "healthStates": [10]})";
    }
    return profile + "]}";
}

tvxbroker::BrokerConfig hostBroker() {
    tvxbroker::BrokerConfig config = tvxbroker::loadBrokerConfig(
        {TVX_PROVIDER_DIR, TVX_HOST_PROVIDER_DIR}, {TVX_PROVIDER_REG, TVX_HOST_PROVIDER_REG},
        {TVX_PRODUCT_MOFS, TVX_HOST_PROVIDER_MOF});
    for (tvxbroker::ProviderRegistration &registration : config.registrations) {
        if (registration.providerName.rfind("Talvex_LatchedHealth", 0) == 0) registration.location = "linkedin";
    }
    config.inProcessLocations = {"linkedin"};
    return config;
}

void poll(benchmark::State &state) {
    const int elements = static_cast<int>(state.range(0));
    char error[256];
    if (HostSim_LoadProfileText(hostWithUnhealthyElements(elements).c_str(), error, sizeof error) != 0) {
        state.SkipWithError(error);
        return;
    }
    tvxbroker::Broker broker(hostBroker());
    const CmpiBroker cmpi(broker.cmpiBroker());
    const CmpiContext thread = cmpi.prepareAttachThread(CmpiContext(broker.newContext(kNs)));
    cmpi.attachThread(thread);
    const OMC::MutexLock lock(TvLatchedHealth::healthMutex);
    TvLatchedHealth::pollWatchedClasses(cmpi, thread);  // latches them all
    for (auto _ : state) TvLatchedHealth::pollWatchedClasses(cmpi, thread);
    state.counters["per_element"] = benchmark::Counter(double(elements) * double(state.iterations()),
                                                       benchmark::Counter::kIsRate | benchmark::Counter::kInvert);
    cmpi.detachThread(thread);
}

BENCHMARK(poll)->Arg(100)->Arg(1000)->Arg(10000)->Unit(benchmark::kMillisecond);

// Both threads started by the shipped instance factory, then stopped while
// they wait, as the broker stops them when it ends.
double cleanupMilliseconds() {
    HostSim_ResetProfile();
    tvxbroker::Broker broker(hostBroker());
    auto *brokerHandle = const_cast<CMPIBroker *>(broker.cmpiBroker());
    CMPIInstanceMI *mi = Talvex_LatchedHealthState_Create_InstanceMI(brokerHandle, broker.newContext(kNs), nullptr);
    for (;;) {
        {
            const OMC::MutexLock lock(TvLatchedHealth::healthMutex);
            if (TvLatchedHealth::runningThreads == 2) break;  // both are waiting now
        }
        std::this_thread::sleep_for(std::chrono::milliseconds(1));
    }
    const auto started = std::chrono::steady_clock::now();
    mi->ft->cleanup(mi, broker.newContext(kNs), 1);
    return std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() - started).count();
}

}  // namespace

int main(int argc, char **argv) {
    FigureKeepingReporter reporter;
    runBenchmarks(argc, argv, reporter);
    if (const auto perElement = reporter.counterOfBoth("poll/100", "poll/10000", "per_element")) {
        const auto [small, large] = *perElement;
        std::printf("one health poll, CPU time per latched element: %.2f us with 100 elements, %.2f us with "
                    "10,000; %.2f times as much (goal: within 1.5)\n",
                    small * 1e6, large * 1e6, large / small);
    }
    std::printf("terminating cleanup while both threads wait: %.2f ms (goal: under 10 ms)\n", cleanupMilliseconds());
    return 0;
}
