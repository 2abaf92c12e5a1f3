// A provider thread's cycles against both brokers the library meets: the
// host's (eighth context entry, no memory table) and stock sfcb (seven
// context entries, memory mark and release). Whatever a cycle makes through
// the binding is given back when it ends, normally or by an exception, so
// the broker's count of live objects does not grow however many cycles run.
// In the stock-sfcb mode AddressSanitizer would report any read of an
// eighth context entry.
#include <gtest/gtest.h>

#include <algorithm>
#include <cstddef>
#include <stdexcept>
#include <string>
#include <thread>

#include "CmpiBroker.h"
#include "core/Broker.h"
#include "platform/ThreadCycleObjects.h"

namespace {

using tvxbroker::ThreadRelease;

// What a polling cycle typically makes: a path, an instance on it, texts.
void makeCycleObjects(int cycle) {
    CmpiObjectPath path("root/cimv2", "Test_Polled");
    path.setKey("Name", "item-" + std::to_string(cycle));
    CmpiInstance instance(path);
    instance.setProperty("Cycle", static_cast<CMPISint32>(cycle));
    instance.setProperty("Text", path.toString());
    instance.setProperty("Self", instance.getObjectPath());
}

TEST(ThreadCycleObjects, ManyCyclesEndedEitherWayLeaveAsManyObjectsAsAFew) {
    for (const ThreadRelease mode : {ThreadRelease::ContextEntry, ThreadRelease::MarkRelease}) {
        SCOPED_TRACE(mode == ThreadRelease::MarkRelease ? "stock sfcb" : "host's broker");
        tvxbroker::BrokerConfig config;
        config.threadRelease = mode;
        tvxbroker::Broker broker{config};
        // Only stock sfcb offers the memory table: that is how the library tells them apart.
        ASSERT_EQ(broker.cmpiBroker()->mft != nullptr, mode == ThreadRelease::MarkRelease);
        const CmpiBroker cmpi(broker.cmpiBroker());
        const CmpiContext threadContext = cmpi.prepareAttachThread(CmpiContext(broker.newContext("root/cimv2")));
        // Sampled after every cycle: on the host's broker the next cycle's
        // release would hide what a failed one left.
        std::size_t afterTen = 0, most = 0;
        std::thread provider([&] {
            cmpi.attachThread(threadContext);
            for (int cycle = 1; cycle <= 2000; ++cycle) {
                try {
                    platform::ThreadCycleObjects objects(cmpi, threadContext);
                    makeCycleObjects(cycle);
                    makeCycleObjects(-cycle);
                    if (cycle % 7 == 0) throw std::runtime_error("the cycle failed");
                    objects.release();
                } catch (const std::runtime_error &) {
                }
                if (cycle == 10) afterTen = broker.liveObjectCount();
                if (cycle >= 10) most = std::max(most, broker.liveObjectCount());
            }
            cmpi.detachThread(threadContext);
        });
        provider.join();
        EXPECT_EQ(most, afterTen);
        broker.shutdown();
    }
}

}  // namespace
