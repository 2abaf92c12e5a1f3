// The product under load from every side at once: clients sending every
// operation to every served class, the provider threads cycling as fast as
// they can be woken, subscriptions to both indication classes made and
// removed, and then a broker shutdown while requests are still in flight.
// Every request must be answered as it is when served alone (or, once the
// shutdown has begun, refused), and nothing may hang: a watchdog fails the
// test and ends the process, naming what it was doing, if the whole does
// not end in time.
#include <gtest/gtest.h>

#include <algorithm>
#include <atomic>
#include <chrono>
#include <condition_variable>
#include <cstdio>
#include <mutex>
#include <thread>

#include "EventSink.h"
#include "LinkedProduct.h"
#include "ServedRequests.h"
#include "hostsim/HostSimControl.h"
#include "latchedhealth/LatchedHealthState.h"
#include "model/PathText.h"

namespace {

using namespace tvxbroker;
using namespace std::chrono_literals;

// Loop counts, not durations: the same work in every preset, a few seconds
// natively and well under a minute under qemu or ThreadSanitizer.
constexpr int kClients = 4;
constexpr int kRounds = 2;  // of the whole request list, per client
constexpr int kThreadCycles = 10;
constexpr int kSubscriptionRounds = 10;
constexpr auto kLimit = 240s;

constexpr const char *kNs = "root/cimv2";
const char *const kIndicationClasses[] = {"Talvex_CIMHeartbeat", "Talvex_KernelIPChangedIndication"};

class Watchdog {
public:
    explicit Watchdog(std::chrono::seconds limit)
        : watcher([this, limit] {
              std::unique_lock<std::mutex> lock(mutex);
              if (endedChanged.wait_for(lock, limit, [this] { return ended; })) return;
              ADD_FAILURE() << "no end within " << limit.count() << " s while " << phase.load();
              std::fflush(stdout);
              std::_Exit(1);
          }) {}
    ~Watchdog() {
        {
            const std::lock_guard<std::mutex> lock(mutex);
            ended = true;
        }
        endedChanged.notify_all();
        watcher.join();
    }

    std::atomic<const char *> phase{"serving"};

private:
    std::mutex mutex;
    std::condition_variable endedChanged;
    bool ended = false;
    std::thread watcher;  // last: it starts once the rest is built
};

class Stress : public testing::TestWithParam<ThreadRelease> {
protected:
    void SetUp() override {
        broker = std::make_unique<Broker>(stress::linkedProductConfig(GetParam()));
        stress::loadEveryProvider(*broker);
        ASSERT_TRUE(broker->awaitFirstThreadReleases(60s));
        requests = stress::servedRequests(*broker);
        for (const stress::ServedRequest &request : requests) alone.push_back(request.send(*broker).rc);
    }

    void TearDown() override {
        broker.reset();
        EXPECT_EQ(HostSim_LiveListCount(), 0u) << "a system-information list was not freed";
        HostSim_ResetProfile();
    }

    // One client: the whole list kRounds times, from its own place in it.
    void client(int number, std::vector<std::string> &faults) {
        const std::size_t count = requests.size();
        for (std::size_t sent = 0; sent < count * kRounds; ++sent) {
            const std::size_t index = (sent + number * count / kClients) % count;
            const Response response = requests[index].send(*broker);
            // Read after the answer: one that came before the shutdown began
            // was served wholly before it.
            const bool refusable = shuttingDown;
            const bool expected = response.rc == alone[index] || (refusable && response.rc == CMPI_RC_ERR_FAILED) ||
                                  gone(requests[index]);
            if (!expected) {
                faults.push_back(requests[index].what + " answered " + std::to_string(response.rc) + " (" +
                                 response.message.value_or("") + "), alone " + std::to_string(alone[index]));
            }
            ++answered;
        }
    }

    // Whether the instance a request is about is one its provider no longer
    // serves, as a latched record whose element's health has risen since.
    bool gone(const stress::ServedRequest &request) {
        if (!request.instance) return false;
        const ObjectPath &path = *request.instance;
        const Response names = broker->enumInstanceNames(ObjectPath{"", path.nameSpace, path.className, {}});
        const std::string text = formatPath(path);
        return names.ok() && std::none_of(names.paths.begin(), names.paths.end(),
                                          [&](const ObjectPath &name) { return formatPath(name) == text; });
    }

    // Drives whole cycles first, then keeps waking the threads until the
    // clients have ended.
    void waker(const std::atomic<bool> &clientsEnded) {
        const stress::ProviderThreadDriver driver(*broker);
        for (int cycle = 0; cycle < kThreadCycles; ++cycle) {
            EXPECT_TRUE(driver.cycleEach(60s)) << "cycle " << cycle;
            ++threadCycles;
        }
        while (!clientsEnded) {
            stress::ProviderThreadDriver::wakeAll();
            std::this_thread::yield();
        }
    }

    // Subscribes to both indication classes and takes the subscriptions
    // away again, until the clients have ended. Before the shutdown every
    // step is accepted, and enable and disable reach the change detector.
    void subscriber(const std::atomic<bool> &clientsEnded, brokertest::EventSink &sink) {
        for (int round = 0; !clientsEnded; ++round) {
            const int subscription = broker->subscribe(sink.subscriber(true));
            for (const char *cls : kIndicationClasses) subscriptionRound(cls);
            broker->unsubscribe(subscription);
            if (round < kSubscriptionRounds) ++subscriptionRounds;
        }
    }

    void subscriptionRound(const std::string &cls) {
        const std::string query = "SELECT * FROM " + cls;
        const bool kernelIp = cls == "Talvex_KernelIPChangedIndication";
        const auto accepted = [this, &cls](const Response &response, const char *step) {
            const bool refusable = shuttingDown;
            EXPECT_TRUE(response.ok() || (refusable && response.rc == CMPI_RC_ERR_FAILED)) << step << " " << cls;
            return response.ok() && !refusable;
        };
        accepted(broker->authorizeFilter(kNs, cls, query, "root"), "authorize");
        accepted(broker->activateFilter(kNs, cls, query, true), "activate");
        if (accepted(broker->enableIndications(kNs, cls), "enable") && kernelIp) {
            const bool enabled = TvLatchedHealth::kernelIpIndication.isEnabled();
            EXPECT_TRUE(enabled || shuttingDown) << "enable did not reach the detector";
        }
        accepted(broker->deActivateFilter(kNs, cls, query, true), "deactivate");
        if (accepted(broker->disableIndications(kNs, cls), "disable") && kernelIp) {
            const bool enabled = TvLatchedHealth::kernelIpIndication.isEnabled();
            EXPECT_TRUE(!enabled || shuttingDown) << "disable did not reach the detector";
        }
    }

    std::unique_ptr<Broker> broker;
    std::vector<stress::ServedRequest> requests;
    std::vector<CMPIrc> alone;  // each request's answer when served alone
    std::atomic<bool> shuttingDown{false};
    // What the main thread waits for before it shuts the broker down.
    std::atomic<int> answered{0}, threadCycles{0}, subscriptionRounds{0};
};

TEST_P(Stress, EveryRequestIsAnsweredUnderLoadAndThroughShutdown) {
    Watchdog watchdog(kLimit);
    ASSERT_FALSE(requests.empty());
    brokertest::EventSink sink;
    std::atomic<bool> clientsEnded{false};
    std::vector<std::vector<std::string>> faults(kClients);
    std::vector<std::thread> clients;
    for (int number = 0; number < kClients; ++number) {
        clients.emplace_back([this, number, &faults] { client(number, faults[number]); });
    }
    std::thread wakes([&] { waker(clientsEnded); });
    std::thread subscriptions([&] { subscriber(clientsEnded, sink); });

    const int total = kClients * kRounds * static_cast<int>(requests.size());
    while (answered < total / 2 || threadCycles < kThreadCycles || subscriptionRounds < kSubscriptionRounds) {
        std::this_thread::sleep_for(1ms);
    }
    watchdog.phase = "shutting the broker down";
    shuttingDown = true;
    const std::size_t heartbeats = sink.received().size();
    broker->shutdown();
    for (std::thread &thread : clients) thread.join();
    clientsEnded = true;
    wakes.join();
    subscriptions.join();

    EXPECT_EQ(answered, total);
    for (const std::vector<std::string> &found : faults) {
        for (std::size_t i = 0; i < found.size() && i < 5; ++i) ADD_FAILURE() << found[i];
    }
    EXPECT_GT(heartbeats, 0u) << "no heartbeat reached a subscriber";
    EXPECT_EQ(broker->liveObjectCount(), 0u);
}

INSTANTIATE_TEST_SUITE_P(BothBrokers, Stress, testing::Values(ThreadRelease::ContextEntry, ThreadRelease::MarkRelease),
                         [](const testing::TestParamInfo<ThreadRelease> &mode) {
                             return mode.param == ThreadRelease::ContextEntry ? "ContextEntry" : "MarkRelease";
                         });

}  // namespace
