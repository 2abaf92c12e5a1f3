// One cycle of the kernel IP change detector as the monitor thread runs it:
// testAndSend re-reads a scripted interface-address list, compares it with
// the baseline, builds and delivers the one indication for the one address
// that changed, and re-reads the baseline. Prints the cost per address on a
// host of 1,024 interfaces and on one of 16 (four addresses each), and how
// many times as much an address costs on the large host (goal: within 1.3).
#include <benchmark/benchmark.h>

#include <cstdio>
#include <string>

#include "CmpiBroker.h"
#include "FigureKeepingReporter.h"
#include "ScriptedInterfaceAddresses.h"
#include "core/Broker.h"
#include "kernelip/KernelIpIndication.h"
#include "platform/ThreadCycleObjects.h"

namespace {

using kipdtest::EntryList;

constexpr int kAddressesPerInterface = 4;

// In the kernel's order: every interface's IPv4 addresses, then every
// interface's IPv6 addresses. With `changed`, the first address of the
// first interface is another one.
EntryList hostAddresses(int interfaces, bool changed) {
    EntryList ipv4;
    EntryList ipv6;
    for (int i = 0; i < interfaces; ++i) {
        const std::string name = "vmk" + std::to_string(i);
        const std::string net = "10." + std::to_string(i / 256) + "." + std::to_string(i % 256) + ".";
        ipv4.push_back(kipdtest::ipv4(name, net + (changed && i == 0 ? "3" : "1")));
        ipv4.push_back(kipdtest::ipv4(name, net + "2"));
        const std::string prefix = "fd00:" + std::to_string(i) + "::";
        ipv6.push_back(kipdtest::ipv6(name, prefix + "1"));
        ipv6.push_back(kipdtest::ipv6(name, prefix + "2"));
    }
    ipv4.insert(ipv4.end(), ipv6.begin(), ipv6.end());
    return ipv4;
}

tvxbroker::BrokerConfig productClasses() {
    tvxbroker::BrokerConfig config;
    for (const char *mof : {TVX_PRODUCT_MOFS}) config.schema.loadFile(mof);
    return config;
}

void detectionCycle(benchmark::State &state) {
    const int interfaces = static_cast<int>(state.range(0));
    tvxbroker::Broker broker(productClasses());
    std::size_t delivered = 0;
    broker.subscribe([&delivered](const std::string &, const tvxbroker::Instance &) {
        ++delivered;
        return true;
    });
    CmpiBroker cmpi(broker.cmpiBroker());
    const CmpiContext thread = cmpi.prepareAttachThread(CmpiContext(broker.newContext("root/cimv2")));
    cmpi.attachThread(thread);

    // Every cycle reads the changed list as the current state and the
    // original as the baseline, so each one finds the same change.
    kipdtest::ScriptedInterfaceAddresses addresses;
    addresses.show({hostAddresses(interfaces, true), hostAddresses(interfaces, false)});
    TVX::KernelIpIndication detector(addresses);
    detector.enableIndication();
    for (auto _ : state) {
        platform::ThreadCycleObjects objects(cmpi, thread);
        detector.testAndSend(thread, &cmpi);
        objects.release();
    }
    if (delivered != static_cast<std::size_t>(state.iterations())) {
        state.SkipWithError("a cycle did not deliver exactly one indication");
    }
    state.counters["per_address"] =
        benchmark::Counter(double(interfaces) * kAddressesPerInterface * double(state.iterations()),
                           benchmark::Counter::kIsRate | benchmark::Counter::kInvert);
    cmpi.detachThread(thread);
    broker.shutdown();
}

BENCHMARK(detectionCycle)->Arg(16)->Unit(benchmark::kMicrosecond);
BENCHMARK(detectionCycle)->Arg(1024)->Unit(benchmark::kMillisecond);

}  // namespace

int main(int argc, char **argv) {
    FigureKeepingReporter reporter;
    runBenchmarks(argc, argv, reporter);
    if (const auto perAddress = reporter.counterOfBoth("detectionCycle/16", "detectionCycle/1024", "per_address")) {
        const auto [small, large] = *perAddress;
        std::printf("one detection cycle, CPU time per address: %.0f ns on 16 interfaces, %.0f ns on 1,024; "
                    "%.2f times as much on the large host (goal: within 1.3)\n",
                    small * 1e9, large * 1e9, large / small);
    }
    return 0;
}
