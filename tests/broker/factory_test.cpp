// How the broker obtains providers through the binding's factories: objects
// shared or kept apart by their base objects, the instance factory's line on
// standard error, and dispatch functions that refuse a handle of the wrong
// kind instead of crashing. A provider that never unloads refusing a cleanup
// shows in the heartbeat's tests.
#include <dlfcn.h>

#include <functional>
#include <memory>

#include "BrokerFixture.h"
#include "cmpi/cmpift.h"

namespace brokertest {
namespace {

constexpr const char *kProviderLibrary = TVX_TESTPROVIDER_DIR "/libtvxtestprovider.so";
const std::string kFactoryLine = "--- _Create_InstanceMI() P10CmpiBaseMI\n";

// Initializations and uses of one provider's objects, as Test_ProviderStats
// reports them.
using Stats = std::pair<std::uint64_t, std::int64_t>;
Stats statsOf(Broker &broker, const std::string &provider) {
    for (const Instance &inst : broker.enumInstances(classPath("Test_ProviderStats"), std::nullopt).instances) {
        const CimValue *name = inst.property("ProviderName");
        const CimValue *useCount = inst.property("UseCount");
        if (name != nullptr && name->text == provider && useCount != nullptr) {
            return {unsignedOf(inst, "Initialized"), useCount->signedValue};
        }
    }
    ADD_FAILURE() << "no statistics of " << provider;
    return {};
}

// Every kind of interface starts with its handle: the provider object.
void *providerObjectOf(void *mi) { return *static_cast<void **>(mi); }

struct Unload {
    void operator()(void *library) const { dlclose(library); }
};

// Factories naming one base object share its provider, created and
// initialized once; factories of different base objects keep theirs apart.
// Every call takes a use, and an instance factory writes its line each time:
// the broker calls each factory once, so the test calls one again itself.
TEST_F(BrokerTest, FactoriesShareProviderObjectsExactlyAsTheirBaseObjectsDo) {
    struct Touch {
        const char *provider;
        InterfaceKind kind;
        std::string written;
    };
    const Touch touches[] = {
        {"WidgetGadgetProvider", InterfaceKind::Association, ""},
        {"WidgetGadgetProvider", InterfaceKind::Instance, kFactoryLine},
        {"EventProvider", InterfaceKind::Indication, ""},
        {"EventStore", InterfaceKind::Instance, kFactoryLine},
    };
    std::vector<void *> interfaces;
    for (const Touch &t : touches) {
        SCOPED_TRACE(t.provider);
        std::string error;
        testing::internal::CaptureStderr();
        void *first = broker.managementInterface(t.provider, t.kind, &error);
        void *again = broker.managementInterface(t.provider, t.kind, &error);
        EXPECT_EQ(testing::internal::GetCapturedStderr(), t.written);
        ASSERT_NE(first, nullptr) << error;
        EXPECT_EQ(again, first);
        interfaces.push_back(first);
    }
    EXPECT_EQ(providerObjectOf(interfaces[0]), providerObjectOf(interfaces[1])) << "one base object, one provider";
    EXPECT_NE(providerObjectOf(interfaces[2]), providerObjectOf(interfaces[3])) << "two base objects, two providers";
    EXPECT_EQ(statsOf(broker, "EventProvider"), (Stats{2, 2}));

    // RTLD_NOLOAD: the library the broker loaded, not a second copy.
    const std::unique_ptr<void, Unload> library(dlopen(kProviderLibrary, RTLD_NOW | RTLD_NOLOAD));
    ASSERT_NE(library, nullptr) << dlerror();
    using Factory = CMPIInstanceMI *(*)(CMPIBroker *, const CMPIContext *, CMPIStatus *);
    const auto factory = reinterpret_cast<Factory>(dlsym(library.get(), "WidgetGadgetProvider_Create_InstanceMI"));
    ASSERT_NE(factory, nullptr) << dlerror();
    auto *mb = const_cast<CMPIBroker *>(broker.cmpiBroker());
    const CMPIContext *ctx = broker.newContext(kNs);
    CMPIStatus rc{CMPI_RC_OK, nullptr};
    testing::internal::CaptureStderr();
    CMPIInstanceMI *once = factory(mb, ctx, &rc);
    CMPIInstanceMI *twice = factory(mb, ctx, &rc);
    EXPECT_EQ(testing::internal::GetCapturedStderr(), kFactoryLine + kFactoryLine);
    EXPECT_EQ(once, interfaces[1]);
    EXPECT_EQ(twice, interfaces[1]);
    EXPECT_EQ(statsOf(broker, "WidgetGadgetProvider"), (Stats{1, 4}));

    // Handing both back leaves only the broker's uses, so shutdown still
    // frees the provider.
    for (CMPIInstanceMI *mi : {once, twice}) EXPECT_EQ(mi->ft->cleanup(mi, ctx, 0).rc, CMPI_RC_OK);
    EXPECT_EQ(statsOf(broker, "WidgetGadgetProvider"), (Stats{1, 2}));
}

// The widget provider has an instance side only, so the association and
// indication entries must refuse its handle rather than reach into nothing.
TEST_F(BrokerTest, DispatchRefusesHandlesOfTheWrongKindWithoutThrowing) {
    auto *widgets = static_cast<CMPIInstanceMI *>(broker.managementInterface("WidgetProvider", InterfaceKind::Instance));
    auto *links = static_cast<CMPIAssociationMI *>(
        broker.managementInterface("WidgetGadgetProvider", InterfaceKind::Association));
    auto *events = static_cast<CMPIIndicationMI *>(broker.managementInterface("EventProvider", InterfaceKind::Indication));
    ASSERT_TRUE(widgets && links && events);
    const CMPIContext *ctx = broker.newContext(kNs);
    CMPIInstanceMI noProvider{nullptr, widgets->ft};
    auto *widgetsAsAssociation = reinterpret_cast<CMPIAssociationMI *>(widgets);

    struct Case {
        const char *call;
        std::function<CMPIStatus()> run;
    };
    const Case cases[] = {
        {"instance entry, null interface",
         [&] { return widgets->ft->enumerateInstanceNames(nullptr, ctx, nullptr, nullptr); }},
        {"instance entry, interface without a provider",
         [&] { return widgets->ft->getInstance(&noProvider, ctx, nullptr, nullptr, nullptr); }},
        {"association entry, instance-only provider",
         [&] { return links->ft->references(widgetsAsAssociation, ctx, nullptr, nullptr, nullptr, nullptr, nullptr); }},
        {"indication entry, instance-only provider",
         [&] { return events->ft->enableIndications(reinterpret_cast<CMPIIndicationMI *>(widgets), ctx); }},
    };
    for (const Case &c : cases) {
        SCOPED_TRACE(c.call);
        EXPECT_EQ(c.run().rc, CMPI_RC_ERR_INVALID_HANDLE);
    }
}

}  // namespace
}  // namespace brokertest
