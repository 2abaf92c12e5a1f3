// One enumInstances through the embedded broker, per class, and one
// associators from a port, on the default host and on a large one; prints
// the time per request and per instance, and how many times longer the
// large host takes, per request and per instance.
#include <benchmark/benchmark.h>

#include <cstdio>
#include <string>

#include "FigureKeepingReporter.h"
#include "core/Broker.h"
#include "hostsim/HostSimControl.h"

namespace {

using namespace tvxbroker;


// Runs `request` on the host of `profileFile` (null: the default host).
template <class Request>
void measure(benchmark::State &state, const char *profileFile, Request &&request) {
    char error[512];
    if (profileFile == nullptr) {
        HostSim_ResetProfile();
    } else if (HostSim_LoadProfileFile(profileFile, error, sizeof error) != 0) {
        state.SkipWithError(error);
        return;
    }
    Broker broker(loadBrokerConfig({TVX_PROVIDER_DIR, TVX_HOST_PROVIDER_DIR},
                                   {TVX_PROVIDER_REG, TVX_HOST_PROVIDER_REG},
                                   {TVX_PRODUCT_MOFS, TVX_HOST_PROVIDER_MOF}));
    std::size_t instances = 0;
    for (auto _ : state) {
        const Response response = request(broker);
        if (!response.ok() || response.instances.empty()) {
            state.SkipWithError("the request answered no instance");
            break;
        }
        instances = response.instances.size();
    }
    state.counters["instances"] = double(instances);
    state.counters["per_instance"] = benchmark::Counter(
        double(instances) * double(state.iterations()),
        benchmark::Counter::kIsRate | benchmark::Counter::kInvert);
    broker.shutdown();
}

void enumerate(benchmark::State &state, const char *className, const char *profileFile) {
    const ObjectPath classPath{"", "root/cimv2", className, {}};
    measure(state, profileFile, [&](Broker &broker) { return broker.enumInstances(classPath, std::nullopt); });
}

// Both far ends of the first port, which every host profile here names
// vmnic0; each is fetched by enumerating its class.
void associate(benchmark::State &state, const char *profileFile) {
    const ObjectPath port{"", "root/cimv2", "Talvex_EthernetPort",
                          {{"SystemCreationClassName", CimValue::makeString("OMC_UnitaryComputerSystem")},
                           {"SystemName", CimValue::makeString("vm")},
                           {"CreationClassName", CimValue::makeString("Talvex_EthernetPort")},
                           {"DeviceID", CimValue::makeString("vmnic0")}}};
    measure(state, profileFile, [&](Broker &broker) { return broker.associators(port, "", "", "", "", std::nullopt); });
}

struct HostPair {
    const char *what;
    const char *small;
    const char *large;
};

const HostPair pairs[] = {
    {"1,000 adapters against the default host's 2", "enumerate/ports_defaultHost",
     "enumerate/ports_1000Adapters"},
    {"64 packages of 32 cores against the default host's 2 of 4",
     "enumerate/processors_defaultHost", "enumerate/processors_64Packages"},
    {"associators from a port, 1,000 adapters against the default host's 2", "associate/port_defaultHost",
     "associate/port_1000Adapters"},
    {"CIM_IPProtocolEndpoint, 4,096 interfaces against 16 (4 addresses each)", "enumerate/endpoints_16Interfaces",
     "enumerate/endpoints_4096Interfaces"},
};

BENCHMARK_CAPTURE(enumerate, ports_defaultHost, "Talvex_EthernetPort", nullptr)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK_CAPTURE(enumerate, ports_1000Adapters, "Talvex_EthernetPort",
                  TVX_PROFILE_DIR "/adapters-1000.json")
    ->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(associate, port_defaultHost, nullptr)->Unit(benchmark::kMicrosecond);
BENCHMARK_CAPTURE(associate, port_1000Adapters, TVX_PROFILE_DIR "/adapters-1000.json")
    ->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(enumerate, processors_defaultHost, "Talvex_Processor", nullptr)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK_CAPTURE(enumerate, processors_64Packages, "Talvex_Processor",
                  TVX_PROFILE_DIR "/processors-many.json")
    ->Unit(benchmark::kMillisecond);

BENCHMARK_CAPTURE(enumerate, endpoints_16Interfaces, "CIM_IPProtocolEndpoint",
                  TVX_PROFILE_DIR "/interfaces-16.json")
    ->Unit(benchmark::kMicrosecond);
BENCHMARK_CAPTURE(enumerate, endpoints_4096Interfaces, "CIM_IPProtocolEndpoint",
                  TVX_PROFILE_DIR "/interfaces-4096.json")
    ->Unit(benchmark::kMillisecond);

}  // namespace

int main(int argc, char **argv) {
    FigureKeepingReporter reporter;
    runBenchmarks(argc, argv, reporter);
    for (const HostPair &pair : pairs) {
        const RunFigures *small = reporter.find(pair.small);
        const RunFigures *large = reporter.find(pair.large);
        if (small == nullptr || large == nullptr) continue;
        const double perRequest = large->secondsPerIteration / small->secondsPerIteration;
        const double smallInstances = small->counters.at("instances");
        const double largeInstances = large->counters.at("instances");
        if (smallInstances == largeInstances) {
            std::printf("%s: %.0f times as long\n", pair.what, perRequest);
            continue;
        }
        std::printf("%s: %.0f times as long, %.2f times as long per instance\n", pair.what, perRequest,
                    perRequest * smallInstances / largeInstances);
    }
    return 0;
}
