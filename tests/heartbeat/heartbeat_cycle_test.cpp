// Heartbeat cycles run one at a time, as the thread runs them, through an
// embedded broker: what each heartbeat carries, and what a refused delivery
// leaves behind.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <syslog.h>
#include <unistd.h>

#include <ctime>

#include "CmpiBroker.h"
#include "EventSink.h"
#include "SyslogCapture.h"
#include "heartbeat/HeartbeatIndication.h"

namespace {

using namespace tvxbroker;
using brokertest::EventSink;
using syslogcapture::LoggedLine;
using syslogcapture::takeLoggedLines;

constexpr const char *kNs = "root/cimv2";

std::string hostName() {
    char name[256] = {};
    gethostname(name, sizeof name - 1);
    return name;
}

class HeartbeatCycle : public testing::Test {
protected:
    void beat() { heartbeat.beat(CmpiBroker(broker.cmpiBroker()), CmpiContext(broker.newContext(kNs))); }

    std::vector<std::uint64_t> stamps() const {
        std::vector<std::uint64_t> result;
        for (const brokertest::Delivery &delivery : sink.received()) {
            const CimValue *stamp = delivery.event.property("stamp");
            result.push_back(stamp != nullptr ? stamp->unsignedValue : ~0ULL);
        }
        return result;
    }

    EventSink sink;
    Broker broker{BrokerConfig{}};
    Heartbeat::HeartbeatIndication heartbeat;
};

TEST_F(HeartbeatCycle, EachHeartbeatCarriesTheHostANewStampAndTheTimeItWasSent) {
    broker.subscribe(sink.subscriber(true));
    const std::time_t before = std::time(nullptr);
    beat();
    beat();
    const std::time_t after = std::time(nullptr);

    EXPECT_THAT(stamps(), testing::ElementsAre(0u, 1u));
    for (const brokertest::Delivery &delivery : sink.received()) {
        EXPECT_EQ(delivery.nameSpace, kNs);
        EXPECT_EQ(delivery.event.path, (ObjectPath{"", kNs, "Talvex_CIMHeartbeat", {}}));
        const CimValue *host = delivery.event.property("hostname");
        const CimValue *stamp = delivery.event.property("stamp");
        const CimValue *time = delivery.event.property("IndicationTime");
        ASSERT_TRUE(host && stamp && time);
        EXPECT_EQ(host->text, hostName());
        EXPECT_EQ(stamp->type, CMPI_uint32);
        ASSERT_EQ(time->type, CMPI_dateTime);
        EXPECT_FALSE(time->dateTime.interval);
        EXPECT_EQ(time->dateTime.microseconds % 1000000, 0u) << "whole seconds";
        EXPECT_GE(time->dateTime.microseconds / 1000000, static_cast<std::uint64_t>(before));
        EXPECT_LE(time->dateTime.microseconds / 1000000, static_cast<std::uint64_t>(after));
    }
    EXPECT_THAT(takeLoggedLines(), testing::IsEmpty());
}

TEST_F(HeartbeatCycle, ARefusedDeliveryIsLoggedAndItsStampIsNotGivenAgain) {
    const int refusing = broker.subscribe(sink.subscriber(false));
    takeLoggedLines();
    beat();
    EXPECT_THAT(takeLoggedLines(), testing::ElementsAre(LoggedLine{LOG_ERR, "Failed to deliver indication\n"}));

    broker.unsubscribe(refusing);
    broker.subscribe(sink.subscriber(true));
    beat();
    EXPECT_THAT(takeLoggedLines(), testing::IsEmpty());
    EXPECT_THAT(stamps(), testing::ElementsAre(0u, 1u));
}

}  // namespace
