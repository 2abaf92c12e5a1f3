// The indication side end to end: the provider's thread delivers through an
// attached context until disabled, holding nothing of the broker's after,
// and a broker shutting down ends it. That each indication operation reaches
// a provider, and that a provider sees a refused delivery, shows in the
// heartbeat's tests; the per-cycle release over many cycles, in the platform's.
#include <filesystem>
#include <thread>

#include "BrokerFixture.h"

namespace brokertest {
namespace {

constexpr const char *kEvent = "Test_Event";

// Five event periods: long enough for a thread still running to show itself.
constexpr std::chrono::milliseconds kQuiet{100};

std::size_t threadCount() {
    const std::filesystem::directory_iterator tasks("/proc/self/task");
    return static_cast<std::size_t>(std::distance(begin(tasks), end(tasks)));
}

TEST_F(BrokerTest, TheEventThreadDeliversUntilDisabledAndEndsWithTheBroker) {
    const std::size_t idle = broker.liveObjectCount();
    broker.subscribe(sink.subscriber(true));
    ASSERT_TRUE(broker.enableIndications(kNs, kEvent).ok());
    ASSERT_TRUE(sink.waitFor(3));
    ASSERT_TRUE(broker.disableIndications(kNs, kEvent).ok());
    EXPECT_EQ(broker.liveObjectCount(), idle);
    const std::vector<Delivery> received = sink.received();
    for (const Delivery &delivery : received) {
        EXPECT_EQ(delivery.nameSpace, kNs);
        EXPECT_EQ(delivery.event.path.className, kEvent);
    }
    EXPECT_FALSE(sink.waitFor(received.size() + 1, kQuiet)) << "an event arrived after disableIndications";

    ASSERT_TRUE(broker.enableIndications(kNs, kEvent).ok());
    ASSERT_TRUE(sink.waitFor(received.size() + 1));
    // Compared with the count while it runs: a sanitizer may start a thread of its own alongside.
    const std::size_t threadsRunning = threadCount();
    broker.shutdown();
    // The kernel's thread list tells no one when it shrinks, and under qemu a
    // joined thread leaves it a moment after the join returns: poll it.
    const auto deadline = std::chrono::steady_clock::now() + kPatience;
    while (threadCount() >= threadsRunning && std::chrono::steady_clock::now() < deadline) {
        std::this_thread::sleep_for(std::chrono::milliseconds(1));
    }
    EXPECT_LT(threadCount(), threadsRunning);
    EXPECT_FALSE(sink.waitFor(sink.received().size() + 1, kQuiet)) << "an event arrived after shutdown";
}

}  // namespace
}  // namespace brokertest
