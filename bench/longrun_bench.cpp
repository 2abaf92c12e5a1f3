// The product on the embedded broker for a long while, on each of the two
// brokers it meets (ThreadRelease ContextEntry and MarkRelease): 10,000
// requests spread over every operation on every served class, and 1,000
// cycles of each provider thread (the heartbeat, the health poll and the
// kernel IP detection), brought on through their conditions instead of
// waiting their periods. Prints the resident memory and the objects the
// broker owns at the start and at the end of each mode, and end/start
// (goal: both flat). Each mode runs in a process of its own, since a broker
// shutdown stops the product's threads for the rest of the process.
#include <sys/wait.h>
#include <unistd.h>

#include <atomic>
#include <chrono>
#include <cstdio>
#include <fstream>
#include <string>

#include "LinkedProduct.h"
#include "ServedRequests.h"

namespace {

using namespace tvxbroker;

constexpr int kRequests = 10000;
constexpr int kCycles = 1000;
constexpr std::chrono::seconds kPatience{60};
const char *const kIndicationClasses[] = {"Talvex_CIMHeartbeat", "Talvex_KernelIPChangedIndication"};

long residentKilobytes() {
    std::ifstream status("/proc/self/status");
    std::string line;
    while (std::getline(status, line)) {
        if (line.rfind("VmRSS:", 0) == 0) return std::stol(line.substr(6));
    }
    return -1;
}

std::string ratio(double end, double start) {
    char text[32];
    if (start > 0) {
        std::snprintf(text, sizeof text, "%.3f", end / start);
    } else {
        std::snprintf(text, sizeof text, "%s", end == start ? "flat (both 0)" : "grew from 0");
    }
    return text;
}

const char *modeName(ThreadRelease mode) {
    return mode == ThreadRelease::ContextEntry ? "ContextEntry (the host's broker)" : "MarkRelease (stock sfcb)";
}

int runMode(ThreadRelease mode) {
    Broker broker(stress::linkedProductConfig(mode));
    std::atomic<std::size_t> delivered{0};
    broker.subscribe([&delivered](const std::string &, const Instance &) {
        ++delivered;
        return true;
    });
    stress::loadEveryProvider(broker);
    if (!broker.awaitFirstThreadReleases(kPatience)) {
        std::fprintf(stderr, "%s: a provider thread ended no first cycle\n", modeName(mode));
        return 1;
    }
    // Subscribed, so that every detection cycle compares the addresses.
    for (const char *cls : kIndicationClasses) {
        broker.activateFilter("root/cimv2", cls, std::string("SELECT * FROM ") + cls, true);
        broker.enableIndications("root/cimv2", cls);
    }
    const std::vector<stress::ServedRequest> requests = stress::servedRequests(broker);
    const stress::ProviderThreadDriver driver(broker);
    // One of everything first: what is made once is there before the start.
    for (const stress::ServedRequest &request : requests) request.send(broker);
    if (!driver.cycleEach(kPatience)) return 1;

    const long startRss = residentKilobytes();
    const std::size_t startLive = broker.liveObjectCount();
    const std::size_t startDelivered = delivered;
    std::size_t sent = 0;
    for (int cycle = 0; cycle < kCycles; ++cycle) {
        for (int i = 0; i < kRequests / kCycles; ++i) requests[sent++ % requests.size()].send(broker);
        if (!driver.cycleEach(kPatience)) {
            std::fprintf(stderr, "%s: the provider threads stopped cycling after %d cycles\n", modeName(mode), cycle);
            return 1;
        }
    }
    const long endRss = residentKilobytes();
    const std::size_t endLive = broker.liveObjectCount();

    std::printf("%s: %zu requests over %zu kinds, %d cycles of each provider thread, %zu heartbeats delivered\n",
                modeName(mode), sent, requests.size(), kCycles, delivered - startDelivered);
    std::printf("  resident memory (VmRSS): start %ld kB, end %ld kB, end/start %s (goal: flat)\n", startRss, endRss,
                ratio(double(endRss), double(startRss)).c_str());
    std::printf("  live broker objects:     start %zu, end %zu, end/start %s (goal: flat)\n", startLive, endLive,
                ratio(double(endLive), double(startLive)).c_str());
    std::fflush(stdout);
    broker.shutdown();
    return 0;
}

}  // namespace

int main() {
    int failures = 0;
    for (ThreadRelease mode : {ThreadRelease::ContextEntry, ThreadRelease::MarkRelease}) {
        std::fflush(stdout);
        const pid_t child = fork();
        if (child == 0) _exit(runMode(mode));
        int status = 0;
        if (child < 0 || waitpid(child, &status, 0) != child || !WIFEXITED(status) || WEXITSTATUS(status) != 0) {
            std::fprintf(stderr, "%s: the run failed\n", modeName(mode));
            ++failures;
        }
    }
    return failures == 0 ? 0 : 1;
}
