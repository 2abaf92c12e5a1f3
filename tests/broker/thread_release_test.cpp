// The broker's two ways of letting an attached provider thread give its
// objects back, as the host's broker and stock sfcb 1.3 offer them, and the
// record of which providers start threads while being loaded.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <set>

#include <cstddef>
#include <functional>
#include <string>
#include <thread>
#include <vector>

#include "cmpi/cmpi_context_ext.h"
#include "core/Broker.h"

namespace {

using namespace tvxbroker;

constexpr const char *kNs = "root/cimv2";

BrokerConfig configFor(ThreadRelease release) {
    BrokerConfig config;
    config.threadRelease = release;
    return config;
}

CMPIString *newString(const CMPIBroker *mb, const char *text) { return mb->eft->newString(mb, text, nullptr); }

std::string textOf(const CMPIString *string) {
    CMPIStatus rc{};
    const char *text = string->ft->getCharPtr(string, &rc);
    return rc.rc == CMPI_RC_OK && text != nullptr ? text : "<unreadable>";
}

CMPIGcStat *mark(const CMPIBroker *mb) {
    CMPIStatus rc{CMPI_RC_ERR_FAILED, nullptr};
    CMPIGcStat *gc = mb->mft->mark(mb, &rc);
    EXPECT_EQ(rc.rc, CMPI_RC_OK);
    return gc;
}

CMPIrc release(const CMPIBroker *mb, const void *gc) { return mb->mft->release(mb, gc).rc; }

// Runs `body` on a thread attached with a context prepared from a request
// context, as a provider's thread runs, or on one that never attached.
void onThread(Broker &broker, bool attached, const std::function<void(const CMPIContext *)> &body) {
    const CMPIBroker *mb = broker.cmpiBroker();
    const CMPIContext *threadContext = mb->bft->prepareAttachThread(mb, broker.newContext(kNs));
    std::thread thread([&] {
        if (attached) {
            EXPECT_EQ(mb->bft->attachThread(mb, threadContext).rc, CMPI_RC_OK);
        }
        body(threadContext);
        if (attached) {
            EXPECT_EQ(mb->bft->detachThread(mb, threadContext).rc, CMPI_RC_OK);
        }
    });
    thread.join();
}

// Only stock sfcb offers the memory table, which is how the library tells
// the two apart; contexts of either table serve alike.
TEST(ThreadRelease, OnlyStockSfcbOffersTheMemoryTable) {
    for (const bool stock : {false, true}) {
        SCOPED_TRACE(stock ? "stock sfcb" : "host's broker");
        Broker broker{configFor(stock ? ThreadRelease::MarkRelease : ThreadRelease::ContextEntry)};
        const CMPIBroker *mb = broker.cmpiBroker();
        ASSERT_EQ(mb->mft != nullptr, stock);
        if (stock) {
            EXPECT_TRUE(mb->mft->mark != nullptr && mb->mft->release != nullptr);
        }

        const CMPIContext *request = broker.newContext(kNs);
        CMPIStatus rc{};
        CMPIContext *copy = request->ft->clone(request, &rc);
        ASSERT_EQ(rc.rc, CMPI_RC_OK);
        const CMPIData entry = copy->ft->getEntry(copy, CMPIInitNameSpace, &rc);
        ASSERT_EQ(rc.rc, CMPI_RC_OK);
        EXPECT_EQ(textOf(entry.value.string), kNs);
        EXPECT_EQ(copy->ft->release(copy).rc, CMPI_RC_OK);
        broker.shutdown();
    }
}

// Reading past stock sfcb's seven context entries kills its provider
// process; here AddressSanitizer stops the reader.
TEST(ThreadRelease, StockSfcbContextsHaveNoEighthEntry) {
#ifndef __SANITIZE_ADDRESS__
    GTEST_SKIP() << "only AddressSanitizer catches a read past the context table";
#else
    GTEST_FLAG_SET(death_test_style, "threadsafe");
    Broker broker{configFor(ThreadRelease::MarkRelease)};
    const CMPIContext *ctx = broker.newContext(kNs);
    EXPECT_DEATH(
        {
            const auto *read = reinterpret_cast<const CMPIContextExtFT *>(ctx->ft);
            volatile auto entry = read->releaseThreadObjects;
            (void)entry;
        },
        "global-buffer-overflow");
#endif
}

// A broker as stock sfcb, which frees every object by the end of a test.
class MarkRelease : public testing::Test {
protected:
    void TearDown() override {
        EXPECT_EQ(broker.liveObjectCount(), 0u);
        broker.shutdown();
    }

    Broker broker{configFor(ThreadRelease::MarkRelease)};
    const CMPIBroker *mb = broker.cmpiBroker();
};

TEST_F(MarkRelease, FreesWhatTheThreadMadeSinceTheMarkAndNothingBefore) {
    for (const bool attached : {true, false}) {
        SCOPED_TRACE(attached ? "attached thread" : "thread that never attached");
        onThread(broker, attached, [&](const CMPIContext *) {
            const std::size_t atStart = broker.liveObjectCount();
            CMPIString *earlier = newString(mb, "earlier");
            CMPIGcStat *outer = mark(mb);
            CMPIString *between = newString(mb, "between");
            const std::size_t beforeInner = broker.liveObjectCount();
            CMPIGcStat *inner = mark(mb);
            newString(mb, "inner one");
            newString(mb, "inner two");

            EXPECT_EQ(release(mb, inner), CMPI_RC_OK);
            EXPECT_EQ(broker.liveObjectCount(), beforeInner);
            EXPECT_EQ(textOf(between), "between");
            EXPECT_EQ(release(mb, outer), CMPI_RC_OK);
            EXPECT_EQ(broker.liveObjectCount(), atStart + 1);
            EXPECT_EQ(textOf(earlier), "earlier");
            EXPECT_EQ(earlier->ft->release(earlier).rc, CMPI_RC_OK);
        });
    }
}

TEST_F(MarkRelease, RefusesAnythingButALiveMark) {
    onThread(broker, true, [&](const CMPIContext *) {
        int local = 0;
        CMPIString *string = newString(mb, "not a mark");
        CMPIGcStat *released = mark(mb);
        ASSERT_EQ(release(mb, released), CMPI_RC_OK);
        CMPIGcStat *outer = mark(mb);
        CMPIGcStat *freedWithOuter = mark(mb);
        ASSERT_EQ(release(mb, outer), CMPI_RC_OK);
        const struct {
            const char *what;
            const void *gc;
        } cases[] = {{"null", nullptr},
                     {"a local variable", &local},
                     {"another broker object", string},
                     {"a mark released before", released},
                     {"a mark an earlier mark freed", freedWithOuter}};
        for (const auto &c : cases) EXPECT_EQ(release(mb, c.gc), CMPI_RC_ERR_INVALID_HANDLE) << c.what;
        EXPECT_EQ(textOf(string), "not a mark");
    });
}

// A mark never released goes with the objects of its thread, and the
// fixture finds nothing left.
TEST_F(MarkRelease, AnUnreleasedMarkGoesWhenTheThreadDetaches) {
    onThread(broker, true, [&](const CMPIContext *) {
        mark(mb);
        newString(mb, "after the mark");
    });
}

// sfcb gives providers of different groups different processes, each with
// its own copy of the library's static state, and may unload a provider
// that idles. Every provider of the library is loaded here as sfcb would
// load it; whichever starts a thread must never be unloaded, and all of them
// name one group, so whatever state two of them share stays shared.
TEST(ProductRegistration, KeepsSharedStateInOneProcessAndThreadedProvidersLoaded) {
    Broker broker{loadBrokerConfig({TVX_PROVIDER_DIR}, {TVX_PROVIDER_REG}, {TVX_PRODUCT_MOFS})};
    std::set<std::string> groups;
    for (const ProviderRegistration &registration : broker.registrations()) {
        groups.insert(registration.group);
        const struct {
            bool served;
            InterfaceKind kind;
        } kinds[] = {{registration.instance, InterfaceKind::Instance},
                     {registration.association, InterfaceKind::Association},
                     {registration.indication, InterfaceKind::Indication}};
        for (const auto &kind : kinds) {
            std::string error;
            if (kind.served) {
                EXPECT_NE(broker.managementInterface(registration.providerName, kind.kind, &error), nullptr) << error;
            }
        }
    }
    EXPECT_EQ(groups.size(), 1u);
    EXPECT_NE(*groups.begin(), "");
    const std::vector<std::string> threaded = broker.threadedProviders();
    EXPECT_THAT(threaded, testing::IsSupersetOf({"Talvex_CIMHeartbeat", "Talvex_LatchedHealthState"}));
    for (const ProviderRegistration &registration : broker.registrations()) {
        const bool starts = std::find(threaded.begin(), threaded.end(), registration.providerName) != threaded.end();
        EXPECT_TRUE(!starts || registration.unloadNever) << registration.className;
    }
    broker.shutdown();
}

}  // namespace
