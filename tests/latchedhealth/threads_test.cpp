// The two polling threads as the shipped factories start them, driven by
// waking them as a spurious wake-up would instead of waiting a period.
// A stop is final for the process, so each case needs a process of its own,
// as ctest runs them.
#include <gmock/gmock.h>
#include <ifaddrs.h>
#include <syslog.h>

#include <atomic>
#include <chrono>
#include <functional>
#include <stdexcept>
#include <thread>

#include "LatchedHealthBroker.h"
#include "SyslogCapture.h"
#include "latchedhealth/LatchedHealthState.h"

extern "C" {
CMPIInstanceMI *Talvex_LatchedHealthState_Create_InstanceMI(CMPIBroker *, const CMPIContext *, CMPIStatus *);
CMPIIndicationMI *Talvex_KernelIPChangedIndication_Create_IndicationMI(CMPIBroker *, const CMPIContext *, CMPIStatus *);
}

namespace {
std::atomic<bool> addressReadThrows{false};
std::atomic<int> addressReads{0};
}  // namespace

extern "C" int __real_getifaddrs(ifaddrs **);

// Compiled as C++, so the detector sees the exception as if its read threw.
extern "C" int __wrap_getifaddrs(ifaddrs **list) {
    ++addressReads;
    if (addressReadThrows.load()) throw std::runtime_error("interface list unavailable");
    return __real_getifaddrs(list);
}

namespace latchedtest {
namespace {

using namespace TvLatchedHealth;
using std::chrono::steady_clock;
using syslogcapture::LoggedLine;

// Generous bounds on waits that must end: a hang fails instead of blocking CI.
constexpr std::chrono::seconds kPatience{20};

bool eventually(const std::function<bool()> &condition) {
    const auto deadline = steady_clock::now() + kPatience;
    while (!condition()) {
        if (steady_clock::now() > deadline) return false;
        std::this_thread::sleep_for(std::chrono::milliseconds(2));
    }
    return true;
}

std::int32_t threadsInLoop() {
    const OMC::MutexLock lock(healthMutex);
    return runningThreads;
}

// Both threads run one more cycle each.
void wakeThreads() {
    const OMC::MutexLock lock(healthMutex);
    healthCondition.broadcast();
}

class ThreadsTest : public LatchedHealthBroker {
protected:
    // The broker knows nothing of the factories called here: the threads
    // are stopped as its shutdown would stop them.
    void TearDown() override {
        cleanup(instanceMI(), true);
        LatchedHealthBroker::TearDown();
    }

    CMPIInstanceMI *instanceMI() {
        return Talvex_LatchedHealthState_Create_InstanceMI(const_cast<CMPIBroker *>(broker->cmpiBroker()),
                                                           broker->newContext(kNs), nullptr);
    }
    CMPIIndicationMI *indicationMI() {
        return Talvex_KernelIPChangedIndication_Create_IndicationMI(const_cast<CMPIBroker *>(broker->cmpiBroker()),
                                                                    broker->newContext(kNs), nullptr);
    }
    template <class MI>
    CMPIStatus cleanup(MI *mi, bool terminating) {
        return mi->ft->cleanup(mi, broker->newContext(kNs), terminating);
    }
};

// Both objects initializing at once start one pair of threads, which a
// cleanup that is not terminating leaves running and a terminating one stops
// without waiting a period.
TEST_F(ThreadsTest, OnePairOfThreadsUntilATerminatingCleanup) {
    CMPIInstanceMI *instance = nullptr;
    CMPIIndicationMI *indication = nullptr;
    std::thread first([&] { instance = instanceMI(); });
    std::thread second([&] { indication = indicationMI(); });
    first.join();
    second.join();
    ASSERT_TRUE(instance && indication);
    ASSERT_TRUE(eventually([] { return threadsInLoop() == 2; }));
    wakeThreads();
    EXPECT_EQ(cleanup(indication, false).rc, CMPI_RC_NEVER_UNLOAD);
    std::this_thread::sleep_for(std::chrono::milliseconds(50));
    EXPECT_EQ(threadsInLoop(), 2);
    const auto started = steady_clock::now();
    EXPECT_EQ(cleanup(indication, true).rc, CMPI_RC_OK);
    EXPECT_LT(steady_clock::now() - started, kPatience);
    EXPECT_EQ(threadsInLoop(), 0);
    EXPECT_EQ(cleanup(instance, true).rc, CMPI_RC_OK);
}

TEST_F(ThreadsTest, RequestsDuringPollsSeeWholePolls) {
    std::string elements;
    for (int i = 0; i < 200; ++i) {
        elements += (i == 0 ? "" : ",") + element("CIM_Sensor", "s" + std::to_string(i), "[10, 11, 12, 13, 14, 15, 16, 17, 18, 19]");
    }
    serve(profileWith(elements));
    instanceMI();
    ASSERT_TRUE(eventually([] { return threadsInLoop() == 2 && recordOf("s199"); })) << "the first poll";
    std::atomic<bool> polling{true};
    std::thread waker([&] {
        for (int poll = 1; poll < 10; ++poll) {
            wakeThreads();
            eventually([&] { return recordOf("s199")->healthState >= 10 + poll; });
        }
        polling = false;
    });
    int mixed = 0, answered = 0;
    while (polling) {
        const Response all = broker->enumInstances(classPath("Talvex_LatchedHealthState"), std::nullopt);
        ASSERT_TRUE(all.ok());
        ++answered;
        if (all.instances.empty()) continue;
        const std::uint64_t first = all.instances.front().property("HealthState")->unsignedValue;
        for (const Instance &record : all.instances) mixed += record.property("HealthState")->unsignedValue != first;
    }
    waker.join();
    EXPECT_GT(answered, 0);
    EXPECT_EQ(mixed, 0) << "a request saw a poll half done";
    EXPECT_EQ(recordOf("s0")->healthState, 19);
}

// A detection cycle that fails is logged, and the next one runs.
TEST_F(ThreadsTest, AFailedDetectionCycleIsLoggedAndTheNextRuns) {
    instanceMI();
    ASSERT_TRUE(eventually([] { return threadsInLoop() == 2; }));
    ASSERT_TRUE(broker->enableIndications(kNs, "Talvex_KernelIPChangedIndication").ok());
    syslogcapture::takeLoggedLines();
    addressReadThrows = true;
    wakeThreads();
    ASSERT_TRUE(eventually([] {
        for (const LoggedLine &line : syslogcapture::takeLoggedLines()) {
            if (line == LoggedLine{LOG_ERR, "Failed testAndSend operation"}) return true;
        }
        return false;
    }));
    addressReadThrows = false;
    const int reads = addressReads.load();
    wakeThreads();
    EXPECT_TRUE(eventually([&] { return addressReads.load() > reads; }));
}

}  // namespace
}  // namespace latchedtest
