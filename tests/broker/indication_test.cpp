// The indication side end to end: the provider's thread delivers in order
// through an attached context, its per-cycle release keeps the broker's
// objects bounded, and disabling or shutting down ends the thread. That each
// indication operation reaches a provider, and that a provider sees a refused
// delivery, shows in the heartbeat's tests.
#include <algorithm>
#include <filesystem>
#include <thread>

#include "BrokerFixture.h"

namespace brokertest {
namespace {

constexpr const char *kEvent = "Test_Event";

// Five event periods: long enough for a thread still running to show itself.
constexpr std::chrono::milliseconds kQuiet{100};

std::uint64_t deliveredCount(Broker &broker) {
    const Response response = broker.enumInstances(classPath("Test_EventCounter"), std::nullopt);
    EXPECT_TRUE(response.ok()) << response.message.value_or("");
    if (response.instances.size() == 1) return unsignedOf(response.instances[0], "Delivered");
    ADD_FAILURE() << response.instances.size() << " event counters";
    return 0;
}

std::size_t threadCount() {
    const std::filesystem::directory_iterator tasks("/proc/self/task");
    return static_cast<std::size_t>(std::distance(begin(tasks), end(tasks)));
}

// The kernel's thread list tells no one when it shrinks, and under qemu a
// joined thread leaves it a moment after the join returns: poll it.
bool threadCountFallsBelow(std::size_t count) {
    const auto deadline = std::chrono::steady_clock::now() + kPatience;
    while (threadCount() >= count) {
        if (std::chrono::steady_clock::now() > deadline) return false;
        std::this_thread::sleep_for(std::chrono::milliseconds(1));
    }
    return true;
}

TEST_F(BrokerTest, TheEventThreadDeliversInOrderAndReleasesEachCycleUntilDisabled) {
    const std::uint64_t deliveredBefore = deliveredCount(broker);
    const std::size_t idle = broker.liveObjectCount();
    broker.subscribe(sink.subscriber(true));
    // Enabled twice, the provider still runs one thread: two would repeat sequence numbers.
    ASSERT_TRUE(broker.enableIndications(kNs, kEvent).ok());
    ASSERT_TRUE(broker.enableIndications(kNs, kEvent).ok());
    // A cycle builds a path, an instance and a datetime; without the release
    // after each delivery, ten cycles would leave some thirty objects behind.
    constexpr std::size_t kCycles = 10;
    constexpr std::size_t kFewCyclesOfObjects = 10;
    std::size_t peak = 0;
    for (std::size_t cycle = 1; cycle <= kCycles; ++cycle) {
        ASSERT_TRUE(sink.waitFor(cycle));
        peak = std::max(peak, broker.liveObjectCount());
    }
    ASSERT_TRUE(broker.disableIndications(kNs, kEvent).ok());
    EXPECT_LE(peak, idle + kFewCyclesOfObjects);
    EXPECT_EQ(broker.liveObjectCount(), idle);

    const std::vector<Delivery> received = sink.received();
    for (std::size_t i = 0; i < received.size(); ++i) {
        SCOPED_TRACE(i);
        const Instance &event = received[i].event;
        EXPECT_EQ(received[i].nameSpace, kNs);
        EXPECT_EQ(event.path.className, kEvent);
        EXPECT_EQ(unsignedOf(event, "Sequence"), i);
        const CimValue *origin = event.property("Origin");
        const CimValue *time = event.property("EventTime");
        ASSERT_TRUE(origin && time);
        EXPECT_EQ(origin->text, "EventProvider");
        EXPECT_FALSE(time->null || time->dateTime.interval);
    }
    EXPECT_FALSE(sink.waitFor(received.size() + 1, kQuiet)) << "an event arrived after disableIndications";
    EXPECT_EQ(deliveredCount(broker) - deliveredBefore, received.size());
}

TEST_F(BrokerTest, ShutdownEndsTheEventThread) {
    broker.subscribe(sink.subscriber(true));
    ASSERT_TRUE(broker.enableIndications(kNs, kEvent).ok());
    ASSERT_TRUE(sink.waitFor(1));
    // Compared with the count while it runs: a sanitizer may start a thread of its own alongside.
    const std::size_t threadsRunning = threadCount();

    broker.shutdown();
    EXPECT_TRUE(threadCountFallsBelow(threadsRunning));
    EXPECT_FALSE(sink.waitFor(sink.received().size() + 1, kQuiet)) << "an event arrived after shutdown";
}

}  // namespace
}  // namespace brokertest
