// Stock sfcb 1.3's way of letting an attached provider thread give its
// objects back, memory mark and release, as the broker offers it in that
// mode (both modes over many cycles: tests/platform), and the record of
// which providers start threads while being loaded.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <set>
#include <string>
#include <thread>
#include <vector>

#include "cmpi/cmpi_context_ext.h"
#include "core/Broker.h"

namespace {

using namespace tvxbroker;

constexpr const char *kNs = "root/cimv2";

CMPIString *newString(const CMPIBroker *mb, const char *text) { return mb->eft->newString(mb, text, nullptr); }

std::string textOf(const CMPIString *string) {
    CMPIStatus rc{};
    const char *text = string->ft->getCharPtr(string, &rc);
    return rc.rc == CMPI_RC_OK && text != nullptr ? text : "<unreadable>";
}

// A broker as stock sfcb, which frees every object by the end of a test.
class MarkRelease : public testing::Test {
protected:
    static BrokerConfig stockSfcb() {
        BrokerConfig config;
        config.threadRelease = ThreadRelease::MarkRelease;
        return config;
    }

    void TearDown() override {
        EXPECT_EQ(broker.liveObjectCount(), 0u);
        broker.shutdown();
    }

    CMPIGcStat *mark() {
        CMPIStatus rc{CMPI_RC_ERR_FAILED, nullptr};
        CMPIGcStat *gc = mb->mft->mark(mb, &rc);
        EXPECT_EQ(rc.rc, CMPI_RC_OK);
        return gc;
    }
    CMPIrc release(const void *gc) { return mb->mft->release(mb, gc).rc; }

    // Runs `body` on a thread attached with a context prepared from a
    // request context, as a provider's thread runs.
    template <class Body>
    void onAttachedThread(Body body) {
        const CMPIContext *threadContext = mb->bft->prepareAttachThread(mb, broker.newContext(kNs));
        std::thread thread([&] {
            EXPECT_EQ(mb->bft->attachThread(mb, threadContext).rc, CMPI_RC_OK);
            body();
            EXPECT_EQ(mb->bft->detachThread(mb, threadContext).rc, CMPI_RC_OK);
        });
        thread.join();
    }

    Broker broker{stockSfcb()};
    const CMPIBroker *mb = broker.cmpiBroker();
};

// Reading past stock sfcb's seven context entries kills its provider
// process; here AddressSanitizer stops the reader.
TEST_F(MarkRelease, ContextsHaveNoEighthEntry) {
#ifndef __SANITIZE_ADDRESS__
    GTEST_SKIP() << "only AddressSanitizer catches a read past the context table";
#else
    GTEST_FLAG_SET(death_test_style, "threadsafe");
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

// A mark left unreleased goes with the objects of its thread when it
// detaches, and the fixture finds nothing left.
TEST_F(MarkRelease, FreesWhatTheThreadMadeSinceTheMarkAndNothingBefore) {
    onAttachedThread([&] {
        const std::size_t atStart = broker.liveObjectCount();
        CMPIString *earlier = newString(mb, "earlier");
        CMPIGcStat *outer = mark();
        CMPIString *between = newString(mb, "between");
        const std::size_t beforeInner = broker.liveObjectCount();
        CMPIGcStat *inner = mark();
        newString(mb, "inner one");
        newString(mb, "inner two");

        EXPECT_EQ(release(inner), CMPI_RC_OK);
        EXPECT_EQ(broker.liveObjectCount(), beforeInner);
        EXPECT_EQ(textOf(between), "between");
        EXPECT_EQ(release(outer), CMPI_RC_OK);
        EXPECT_EQ(broker.liveObjectCount(), atStart + 1);
        EXPECT_EQ(textOf(earlier), "earlier");
        EXPECT_EQ(earlier->ft->release(earlier).rc, CMPI_RC_OK);
        mark();
        newString(mb, "after a mark never released");
    });
}

TEST_F(MarkRelease, RefusesAnythingButALiveMark) {
    onAttachedThread([&] {
        CMPIString *string = newString(mb, "not a mark");
        CMPIGcStat *released = mark();
        ASSERT_EQ(release(released), CMPI_RC_OK);
        CMPIGcStat *outer = mark();
        CMPIGcStat *freedWithOuter = mark();
        ASSERT_EQ(release(outer), CMPI_RC_OK);
        const struct {
            const char *what;
            const void *gc;
        } cases[] = {{"null", nullptr},
                     {"another broker object", string},
                     {"a mark released before", released},
                     {"a mark an earlier mark freed", freedWithOuter}};
        for (const auto &c : cases) EXPECT_EQ(release(c.gc), CMPI_RC_ERR_INVALID_HANDLE) << c.what;
        EXPECT_EQ(textOf(string), "not a mark");
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
        const std::pair<bool, InterfaceKind> kinds[] = {{registration.instance, InterfaceKind::Instance},
                                                        {registration.association, InterfaceKind::Association},
                                                        {registration.indication, InterfaceKind::Indication}};
        for (const auto &[served, kind] : kinds) {
            std::string error;
            if (served) {
                EXPECT_NE(broker.managementInterface(registration.providerName, kind, &error), nullptr) << error;
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
