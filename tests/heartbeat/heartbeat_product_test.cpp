// The shipped library's heartbeat as sfcb drives it: loaded by the first
// subscription request, it beats at once, accepts every indication
// operation, refuses to be unloaded while the broker runs, and ends with
// the broker.
#include <gtest/gtest.h>

#include <functional>

#include "EventSink.h"
#include "cmpi/cmpift.h"

namespace {

using namespace tvxbroker;
using brokertest::EventSink;

constexpr const char *kNs = "root/cimv2";
constexpr const char *kHeartbeat = "Talvex_CIMHeartbeat";
constexpr const char *kQuery = "SELECT * FROM Talvex_CIMHeartbeat";

TEST(HeartbeatProduct, BeatsOnceLoadedAndAcceptsWhatSfcbAsksUntilShutdown) {
    EventSink sink;
    Broker broker(loadBrokerConfig({TVX_PROVIDER_DIR, TVX_HOST_PROVIDER_DIR}, {TVX_PROVIDER_REG, TVX_HOST_PROVIDER_REG},
                                  {TVX_PRODUCT_MOFS, TVX_HOST_PROVIDER_MOF}));
    broker.subscribe(sink.subscriber(true));

    const std::function<Response()> operations[] = {
        [&] { return broker.authorizeFilter(kNs, kHeartbeat, kQuery, "root"); },
        [&] { return broker.mustPoll(kNs, kHeartbeat, kQuery); },
        [&] { return broker.activateFilter(kNs, kHeartbeat, kQuery, true); },
        [&] { return broker.enableIndications(kNs, kHeartbeat); },
        [&] { return broker.disableIndications(kNs, kHeartbeat); },
        [&] { return broker.deActivateFilter(kNs, kHeartbeat, kQuery, true); },
    };
    for (const auto &operation : operations) {
        const Response response = operation();
        EXPECT_TRUE(response.ok()) << response.rc << " " << response.message.value_or("");
    }
    ASSERT_TRUE(sink.waitFor(1));
    EXPECT_EQ(sink.received().front().event.path.className, kHeartbeat);

    auto *mi = static_cast<CMPIIndicationMI *>(broker.managementInterface(kHeartbeat, InterfaceKind::Indication));
    ASSERT_NE(mi, nullptr);
    EXPECT_STREQ(mi->ft->miName, "indicationTalvex_CIMHeartbeat");
    EXPECT_EQ(mi->ft->ftVersion, CMPICurrentVersion);
    EXPECT_EQ(mi->ft->miVersion, CMPICurrentVersion);
    EXPECT_EQ(mi->ft->cleanup(mi, broker.newContext(kNs), false).rc, CMPI_RC_NEVER_UNLOAD);

    broker.shutdown();
    EXPECT_EQ(broker.liveObjectCount(), 0u);
}

}  // namespace
