// One enumInstances of Talvex_EthernetPort through the embedded broker, on
// the default host and on a host with 1,000 adapters; prints the time per
// request and per adapter, and the ratio between the two hosts.
#include <benchmark/benchmark.h>

#include <cstdio>
#include <map>
#include <string>

#include "core/Broker.h"
#include "hostsim/HostSimControl.h"

namespace {

using namespace tvxbroker;

std::map<std::string, double> nanosPerRequest;

void enumeratePorts(benchmark::State &state, const char *profileFile) {
    char error[512];
    if (profileFile == nullptr) {
        HostSim_ResetProfile();
    } else if (HostSim_LoadProfileFile(profileFile, error, sizeof error) != 0) {
        state.SkipWithError(error);
        return;
    }
    Broker broker(loadBrokerConfig({TVX_PROVIDER_DIR}, TVX_PRODUCT_REGISTRATION, {TVX_PRODUCT_MOFS}));
    const ObjectPath ports{"", "root/cimv2", "Talvex_EthernetPort", {}};
    std::size_t adapters = 0;
    for (auto _ : state) {
        const Response response = broker.enumInstances(ports, std::nullopt);
        if (!response.ok()) {
            state.SkipWithError("enumInstances failed");
            break;
        }
        adapters = response.instances.size();
    }
    state.counters["adapters"] = double(adapters);
    state.counters["per_adapter"] = benchmark::Counter(
        double(adapters) * double(state.iterations()),
        benchmark::Counter::kIsRate | benchmark::Counter::kInvert);
    broker.shutdown();
}

void defaultHost(benchmark::State &state) { enumeratePorts(state, nullptr); }
void thousandAdapters(benchmark::State &state) {
    enumeratePorts(state, TVX_PROFILE_DIR "/adapters-1000.json");
}

BENCHMARK(defaultHost)->Unit(benchmark::kMicrosecond);
BENCHMARK(thousandAdapters)->Unit(benchmark::kMillisecond);

class RatioReporter : public benchmark::ConsoleReporter {
public:
    RatioReporter() : ConsoleReporter(OO_Tabular) {}

    void ReportRuns(const std::vector<Run> &runs) override {
        for (const Run &run : runs) {
            if (run.iterations > 0) nanosPerRequest[run.benchmark_name()] = run.GetAdjustedRealTime() *
                                                                           unitNanos(run.time_unit);
        }
        ConsoleReporter::ReportRuns(runs);
    }

private:
    static double unitNanos(benchmark::TimeUnit unit) {
        switch (unit) {
            case benchmark::kMicrosecond: return 1e3;
            case benchmark::kMillisecond: return 1e6;
            case benchmark::kSecond: return 1e9;
            default: return 1;
        }
    }
};

}  // namespace

int main(int argc, char **argv) {
    benchmark::Initialize(&argc, argv);
    RatioReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    benchmark::Shutdown();
    const auto small = nanosPerRequest.find("defaultHost");
    const auto large = nanosPerRequest.find("thousandAdapters");
    if (small != nanosPerRequest.end() && large != nanosPerRequest.end()) {
        std::printf("1,000 adapters take %.0f times as long as the default host's 2\n",
                    large->second / small->second);
    }
    return 0;
}
