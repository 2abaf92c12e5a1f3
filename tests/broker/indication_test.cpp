// The indication side end to end: every operation reaches the provider, its
// thread delivers in order through an attached context, refusals are seen by
// the provider, its per-cycle release keeps the broker's objects bounded, and
// disabling or shutting down ends the thread.
#include <algorithm>
#include <filesystem>
#include <functional>
#include <thread>

#include "BrokerFixture.h"

namespace brokertest {
namespace {

constexpr const char *kEvent = "Test_Event";
constexpr const char *kQuery = "SELECT * FROM Test_Event";

// Five event periods: long enough for a thread still running to show itself.
constexpr std::chrono::milliseconds kQuiet{100};

struct EventCounts {
    std::uint64_t delivered = 0;
    std::uint64_t refused = 0;
};

EventCounts eventCounts(Broker &broker) {
    const Response response = broker.enumInstances(classPath("Test_EventCounter"), std::nullopt);
    EXPECT_TRUE(response.ok()) << response.message.value_or("");
    if (response.instances.size() != 1) {
        ADD_FAILURE() << response.instances.size() << " event counters";
        return {};
    }
    return {unsignedOf(response.instances[0], "Delivered"), unsignedOf(response.instances[0], "Refused")};
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

TEST_F(BrokerTest, EveryIndicationOperationReachesTheProvider) {
    struct Case {
        const char *operation;
        std::function<Response()> call;
    };
    const Case cases[] = {
        {"authorizeFilter", [&] { return broker.authorizeFilter(kNs, kEvent, kQuery, "tester"); }},
        {"mustPoll", [&] { return broker.mustPoll(kNs, kEvent, kQuery); }},
        {"activateFilter", [&] { return broker.activateFilter(kNs, kEvent, kQuery, true); }},
        {"enableIndications", [&] { return broker.enableIndications(kNs, kEvent); }},
        {"disableIndications", [&] { return broker.disableIndications(kNs, kEvent); }},
        {"deActivateFilter", [&] { return broker.deActivateFilter(kNs, kEvent, kQuery, true); }},
    };
    for (const Case &c : cases) {
        const Response response = c.call();
        EXPECT_TRUE(response.ok()) << c.operation << ": " << response.rc << " "
                                   << response.message.value_or("");
    }
}

TEST_F(BrokerTest, TheEventThreadDeliversInOrderUntilDisabled) {
    const EventCounts before = eventCounts(broker);
    broker.subscribe(sink.subscriber(true));
    // Enabled twice, the provider still runs one thread: two would repeat sequence numbers.
    ASSERT_TRUE(broker.enableIndications(kNs, kEvent).ok());
    ASSERT_TRUE(broker.enableIndications(kNs, kEvent).ok());
    ASSERT_TRUE(sink.waitFor(3));
    ASSERT_TRUE(broker.disableIndications(kNs, kEvent).ok());

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
    const EventCounts after = eventCounts(broker);
    EXPECT_EQ(after.delivered - before.delivered, received.size());
    EXPECT_EQ(after.refused, before.refused);
}

TEST_F(BrokerTest, TheProviderCountsDeliveriesASubscriberRefuses) {
    const EventCounts before = eventCounts(broker);
    broker.subscribe(sink.subscriber(false));
    ASSERT_TRUE(broker.enableIndications(kNs, kEvent).ok());
    ASSERT_TRUE(sink.waitFor(3));
    ASSERT_TRUE(broker.disableIndications(kNs, kEvent).ok());

    const EventCounts after = eventCounts(broker);
    EXPECT_EQ(after.refused - before.refused, sink.received().size());
    EXPECT_EQ(after.delivered, before.delivered);
}

TEST_F(BrokerTest, BrokerObjectsAreFreedAfterRequestsAndStayBoundedWhileTheThreadRuns) {
    const std::size_t idle = broker.liveObjectCount();
    for (const char *cls : {"Test_Widget", "Test_Gadget", "Test_WidgetGadget", "Test_ProviderStats"}) {
        ASSERT_TRUE(broker.enumInstances(classPath(cls), std::nullopt).ok()) << cls;
    }
    ASSERT_TRUE(broker.associators(widget("alpha"), "", "", "", "", std::nullopt).ok());
    ASSERT_EQ(broker.getInstance(widget("x"), std::nullopt).rc, CMPI_RC_ERR_NOT_FOUND);
    EXPECT_EQ(broker.liveObjectCount(), idle);

    // A cycle builds a path, an instance and a datetime; without the release
    // after each delivery, ten cycles would leave some thirty objects behind.
    constexpr std::size_t kCycles = 10;
    constexpr std::size_t kFewCyclesOfObjects = 10;
    broker.subscribe(sink.subscriber(true));
    ASSERT_TRUE(broker.enableIndications(kNs, kEvent).ok());
    std::size_t peak = 0;
    for (std::size_t cycle = 1; cycle <= kCycles; ++cycle) {
        ASSERT_TRUE(sink.waitFor(cycle));
        peak = std::max(peak, broker.liveObjectCount());
    }
    ASSERT_TRUE(broker.disableIndications(kNs, kEvent).ok());
    EXPECT_LE(peak, idle + kFewCyclesOfObjects);
    EXPECT_EQ(broker.liveObjectCount(), idle);
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
