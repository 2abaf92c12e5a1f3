// The heartbeat thread's whole life, driven as the broker drives the
// provider, with thread creation failing on demand. Its state is
// process-wide and a stop is final, so the life is one test told in order.
// Cycles after the first are brought on by waking the thread, as a
// spurious wake-up would, instead of waiting a period.
#include <gtest/gtest.h>

#include <pthread.h>
#include <syslog.h>

#include <atomic>
#include <cerrno>
#include <chrono>

#include "CmpiProviderFactory.h"
#include "EventSink.h"
#include "SyslogCapture.h"
#include "heartbeat/HeartbeatInterval.h"
#include "heartbeat/HeartbeatProvider.h"
#include "heartbeat/HeartbeatState.h"

namespace {

std::atomic<int> threadCreationsToFail{0};

}  // namespace

// The factory the broker would call, here with the test's own base object.
CMProviderBase(HeartbeatLife);
CMIndicationMIFactory(Heartbeat::HeartbeatProvider, HeartbeatLife)

extern "C" int __real_pthread_create(pthread_t *, const pthread_attr_t *, void *(*)(void *), void *);

extern "C" int __wrap_pthread_create(pthread_t *thread, const pthread_attr_t *attr, void *(*entry)(void *),
                                     void *arg) {
    if (threadCreationsToFail.load() > 0) {
        --threadCreationsToFail;
        return EAGAIN;
    }
    return __real_pthread_create(thread, attr, entry, arg);
}

namespace {

using namespace Heartbeat;
using namespace tvxbroker;
using brokertest::EventSink;
using syslogcapture::LoggedLine;
using syslogcapture::takeLoggedLines;
using std::chrono::steady_clock;

constexpr const char *kNs = "root/cimv2";
// Long enough for a heartbeat that should not come to show itself.
constexpr std::chrono::milliseconds kQuiet{300};

// Starts the next cycle at once; only a waiting thread lets go of the mutex.
void wakeHeartbeatThread() {
    const OMC::MutexLock lock(heartbeatMutex);
    heartbeatCondition.broadcast();
}

bool threadRunning() {
    const OMC::MutexLock lock(heartbeatMutex);
    return heartbeatRunning;
}

std::uint64_t lastStamp(const EventSink &sink) {
    const brokertest::Delivery last = sink.received().back();
    EXPECT_EQ(last.nameSpace, kNs);
    const CimValue *stamp = last.event.property("stamp");
    EXPECT_TRUE(stamp != nullptr && stamp->type == CMPI_uint32);
    return stamp != nullptr ? stamp->unsignedValue : ~0ULL;
}

// The provider as the broker reaches it: through a factory, and the
// cleanup entry of the interface it returns.
struct LoadedHeartbeat {
    Broker &from;
    const CMPIContext *ctx;
    CMPIIndicationMI *mi = nullptr;

    // Whatever fails on the way, the thread ends before the broker does.
    ~LoadedHeartbeat() {
        if (baseHeartbeatLife.getBaseMI() != nullptr) cleanup(true);
    }

    CmpiStatus load() {
        try {
            mi = HeartbeatLife_Create_IndicationMI(const_cast<CMPIBroker *>(from.cmpiBroker()), ctx, nullptr);
            return CmpiStatus(CMPI_RC_OK);
        } catch (const CmpiStatus &status) {
            return status;
        }
    }

    CMPIrc cleanup(bool terminating) { return mi->ft->cleanup(mi, ctx, terminating).rc; }
};

TEST(HeartbeatLife, BeatsFromLoadingUntilATerminatingCleanupAndNeverAgain) {
    EventSink sink;
    Broker broker{BrokerConfig{}};
    int subscription = broker.subscribe(sink.subscriber(true));
    const auto resubscribe = [&](bool accept) {
        broker.unsubscribe(subscription);
        subscription = broker.subscribe(sink.subscriber(accept));
    };
    const CMPIContext *ctx = broker.newContext(kNs);
    LoadedHeartbeat heartbeat{broker, ctx};

    // What each initialize logs of the configuration on this machine.
    takeLoggedLines();
    readHeartbeatInterval(kBrokerConfigFile, heartbeatIntervalSeconds);
    const std::vector<LoggedLine> configuration = takeLoggedLines();

    // A thread that cannot be created: the factory lets the status out and
    // keeps no provider.
    threadCreationsToFail = 1;
    const CmpiStatus failed = heartbeat.load();
    EXPECT_EQ(failed.rc(), CMPI_RC_ERR_FAILED);
    EXPECT_STREQ(failed.msg(), "Failed to start heartbeat indication thread");
    std::vector<LoggedLine> expected = configuration;
    expected.push_back({LOG_ERR, "Failed to start heartbeat indication thread"});
    EXPECT_EQ(takeLoggedLines(), expected);
    EXPECT_EQ(baseHeartbeatLife.getBaseMI(), nullptr);
    EXPECT_FALSE(threadRunning());

    // The first heartbeat goes out at once.
    const std::chrono::milliseconds prompt = std::chrono::seconds(heartbeatIntervalSeconds.load()) / 10;
    ASSERT_EQ(heartbeat.load().rc(), CMPI_RC_OK);
    ASSERT_TRUE(sink.waitFor(1, prompt));
    EXPECT_EQ(lastStamp(sink), 0u);

    // Another provider object starts no second thread.
    HeartbeatProvider other(CmpiBroker(broker.cmpiBroker()), CmpiContext(ctx));
    ASSERT_EQ(other.initialize(CmpiContext(ctx)).rc(), CMPI_RC_OK);
    EXPECT_FALSE(sink.waitFor(2, kQuiet));

    // A cleanup that is not terminating is refused, and the thread beats on
    // each time it wakes. A refused heartbeat is logged (checked with the rest
    // at the end), and its stamp is given to no other.
    EXPECT_EQ(heartbeat.cleanup(false), CMPI_RC_NEVER_UNLOAD);
    resubscribe(false);
    wakeHeartbeatThread();
    ASSERT_TRUE(sink.waitFor(2, prompt));
    EXPECT_EQ(lastStamp(sink), 1u);
    resubscribe(true);
    wakeHeartbeatThread();
    ASSERT_TRUE(sink.waitFor(3, prompt));
    EXPECT_EQ(lastStamp(sink), 2u);

    // A terminating cleanup ends the waiting thread at once, and for good.
    const steady_clock::time_point stopping = steady_clock::now();
    EXPECT_EQ(heartbeat.cleanup(true), CMPI_RC_OK);
    EXPECT_LT(steady_clock::now() - stopping, prompt);
    EXPECT_FALSE(threadRunning());
    wakeHeartbeatThread();
    ASSERT_EQ(heartbeat.load().rc(), CMPI_RC_OK);
    EXPECT_FALSE(threadRunning());
    EXPECT_FALSE(sink.waitFor(4, kQuiet));

    // Three initializes read the configuration; the refusal came between the
    // second and the third.
    expected = configuration;
    expected.insert(expected.end(), configuration.begin(), configuration.end());
    expected.push_back({LOG_ERR, "Failed to deliver indication\n"});
    expected.insert(expected.end(), configuration.begin(), configuration.end());
    EXPECT_EQ(takeLoggedLines(), expected) << "nothing logged but the configuration and the refusal";
}

}  // namespace
