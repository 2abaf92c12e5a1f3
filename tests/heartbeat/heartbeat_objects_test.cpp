// A heartbeat thread runs for the broker's whole life, so each beat must
// give back what it obtained from the broker, on both brokers the library
// meets, while the indication built before the first beat lives on.
#include <gtest/gtest.h>

#include "EventSink.h"
#include "heartbeat/HeartbeatIndication.h"

namespace {

using namespace tvxbroker;

class HeartbeatObjects : public testing::TestWithParam<ThreadRelease> {};

TEST_P(HeartbeatObjects, BeatsLeaveNoObjectsBehind) {
    BrokerConfig config;
    config.threadRelease = GetParam();
    Broker broker(std::move(config));
    brokertest::EventSink sink;
    int subscription = broker.subscribe(sink.subscriber(true));
    const CmpiBroker cmpi(broker.cmpiBroker());
    const CmpiContext thread = cmpi.prepareAttachThread(CmpiContext(broker.newContext("root/cimv2")));
    cmpi.attachThread(thread);
    const std::size_t attached = broker.liveObjectCount();
    {
        Heartbeat::HeartbeatIndication heartbeat(cmpi, thread);
        for (int beat = 0; beat < 5; ++beat) {
            heartbeat.beat(cmpi, thread);
            EXPECT_EQ(broker.liveObjectCount(), attached) << "after beat " << beat;
        }
        // A refused delivery hands the thread a status text to give back too.
        broker.unsubscribe(subscription);
        subscription = broker.subscribe(sink.subscriber(false));
        heartbeat.beat(cmpi, thread);
        EXPECT_EQ(broker.liveObjectCount(), attached) << "after a refused beat";
    }
    const std::vector<brokertest::Delivery> delivered = sink.received();
    ASSERT_EQ(delivered.size(), 6u);
    for (std::size_t beat = 0; beat < delivered.size(); ++beat) {
        const Instance &event = delivered[beat].event;
        EXPECT_EQ(event.property("stamp")->unsignedValue, beat);
        ASSERT_NE(event.property("hostname"), nullptr);
        EXPECT_FALSE(event.property("hostname")->null);
        EXPECT_EQ(event.property("IndicationTime")->type, CMPI_dateTime);
    }
    cmpi.detachThread(thread);
}

INSTANTIATE_TEST_SUITE_P(BothBrokers, HeartbeatObjects,
                         testing::Values(ThreadRelease::ContextEntry, ThreadRelease::MarkRelease),
                         [](const testing::TestParamInfo<ThreadRelease> &mode) {
                             return mode.param == ThreadRelease::ContextEntry ? "ContextEntry" : "MarkRelease";
                         });

}  // namespace
