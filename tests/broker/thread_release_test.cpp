// Stock sfcb 1.3's way of letting an attached provider thread give its
// objects back, memory mark and release, as the broker offers it in that
// mode, and the record of which providers start threads while being loaded.
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

// A broker as stock sfcb, which frees every object by the end of a test.
class MarkRelease : public testing::Test {
protected:
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

    Broker broker{[] {
        BrokerConfig config;
        config.threadRelease = ThreadRelease::MarkRelease;
        return config;
    }()};
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

// The product's threads mark and release once per cycle (their objects over
// many cycles: the heartbeat's tests); a release of anything but a live mark
// is refused.
TEST_F(MarkRelease, RefusesAnythingButALiveMark) {
    const CMPIContext *threadContext = mb->bft->prepareAttachThread(mb, broker.newContext(kNs));
    std::thread provider([&] {
        ASSERT_EQ(mb->bft->attachThread(mb, threadContext).rc, CMPI_RC_OK);
        CMPIString *string = mb->eft->newString(mb, "not a mark", nullptr);
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
        CMPIStatus rc{};
        EXPECT_STREQ(string->ft->getCharPtr(string, &rc), "not a mark");
        EXPECT_EQ(rc.rc, CMPI_RC_OK);
        EXPECT_EQ(mb->bft->detachThread(mb, threadContext).rc, CMPI_RC_OK);
    });
    provider.join();
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
