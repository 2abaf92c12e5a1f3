// A provider thread's cycles against both brokers the library meets: the
// host's (eighth context entry, no memory table) and stock sfcb (seven
// context entries, memory mark and release). Whatever a cycle makes through
// the binding is given back when it ends, normally or by an exception, so
// the broker's count of live objects does not grow however many cycles run.
// In the stock-sfcb mode AddressSanitizer would report any read of an
// eighth context entry.
#include <gtest/gtest.h>

#include <cstddef>
#include <functional>
#include <stdexcept>
#include <string>
#include <thread>

#include "CmpiBroker.h"
#include "core/Broker.h"
#include "platform/ThreadCycleObjects.h"

namespace {

using platform::ThreadCycleObjects;
using tvxbroker::Broker;
using tvxbroker::BrokerConfig;
using tvxbroker::ThreadRelease;

constexpr const char *kNs = "root/cimv2";

const struct Mode {
    const char *name;
    ThreadRelease release;
} kModes[] = {{"host's broker", ThreadRelease::ContextEntry}, {"stock sfcb", ThreadRelease::MarkRelease}};

BrokerConfig configFor(ThreadRelease release) {
    BrokerConfig config;
    config.threadRelease = release;
    return config;
}

// What a polling cycle typically makes: a path, an instance on it, texts.
void makeCycleObjects(int cycle) {
    CmpiObjectPath path(kNs, "Test_Polled");
    path.setKey("Name", "item-" + std::to_string(cycle));
    CmpiInstance instance(path);
    instance.setProperty("Cycle", static_cast<CMPISint32>(cycle));
    instance.setProperty("Text", path.toString());
    instance.setProperty("Self", instance.getObjectPath());
}

// Runs `body` on a thread of its own, attached with a context prepared from
// a request context, as a provider starts its thread.
void onAttachedThread(Broker &broker, const std::function<void(const CmpiBroker &, const CmpiContext &)> &body) {
    const CmpiBroker cmpi(broker.cmpiBroker());
    const CmpiContext threadContext = cmpi.prepareAttachThread(CmpiContext(broker.newContext(kNs)));
    std::thread thread([&] {
        cmpi.attachThread(threadContext);
        body(cmpi, threadContext);
        cmpi.detachThread(threadContext);
    });
    thread.join();
}

TEST(ThreadCycleObjects, ManyCyclesLeaveAsManyObjectsAsAFew) {
    for (const Mode &mode : kModes) {
        SCOPED_TRACE(mode.name);
        Broker broker{configFor(mode.release)};
        std::size_t afterTen = 0;
        std::size_t afterAll = 0;
        onAttachedThread(broker, [&](const CmpiBroker &cmpi, const CmpiContext &ctx) {
            for (int cycle = 1; cycle <= 2000; ++cycle) {
                ThreadCycleObjects objects(cmpi, ctx);
                makeCycleObjects(cycle);
                makeCycleObjects(-cycle);
                objects.release();
                if (cycle == 10) afterTen = broker.liveObjectCount();
            }
            afterAll = broker.liveObjectCount();
        });
        EXPECT_EQ(afterAll, afterTen);
        broker.shutdown();
    }
}

TEST(ThreadCycleObjects, ACycleEndedByAnExceptionLeavesNothingBehind) {
    for (const Mode &mode : kModes) {
        SCOPED_TRACE(mode.name);
        Broker broker{configFor(mode.release)};
        onAttachedThread(broker, [&](const CmpiBroker &cmpi, const CmpiContext &ctx) {
            const std::size_t before = broker.liveObjectCount();
            try {
                ThreadCycleObjects objects(cmpi, ctx);
                makeCycleObjects(1);
                EXPECT_GT(broker.liveObjectCount(), before);
                throw std::runtime_error("the cycle failed");
            } catch (const std::runtime_error &) {
            }
            EXPECT_EQ(broker.liveObjectCount(), before);
        });
        broker.shutdown();
    }
}

}  // namespace
