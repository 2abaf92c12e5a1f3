// How the broker obtains providers through the binding's factories: objects
// shared or kept apart by their base objects, the instance factory's line on
// standard error, providers that cannot be loaded, and dispatch functions
// that refuse a handle of the wrong kind instead of crashing.
#include <dlfcn.h>

#include <functional>
#include <memory>

#include "BrokerFixture.h"
#include "cmpi/cmpift.h"

namespace brokertest {
namespace {

using testing::AllOf;
using testing::HasSubstr;
using testing::Not;
using testing::Optional;

constexpr const char *kProviderLibrary = TVX_TESTPROVIDER_DIR "/libtvxtestprovider.so";

std::string factoryLines(int count) {
    std::string lines;
    for (int i = 0; i < count; ++i) lines += "--- _Create_InstanceMI() P10CmpiBaseMI\n";
    return lines;
}

struct ProviderStats {
    std::uint64_t constructed = 0;
    std::uint64_t initialized = 0;
    std::uint64_t destroyed = 0;
    std::int64_t useCount = 0;
};

ProviderStats statsOf(Broker &broker, const std::string &providerClass) {
    const Response response = broker.enumInstances(classPath("Test_ProviderStats"), std::nullopt);
    EXPECT_TRUE(response.ok()) << response.message.value_or("");
    for (const Instance &inst : response.instances) {
        const CimValue *name = inst.property("ProviderName");
        const CimValue *useCount = inst.property("UseCount");
        if (name == nullptr || name->text != providerClass || useCount == nullptr) continue;
        return {unsignedOf(inst, "Constructed"), unsignedOf(inst, "Initialized"), unsignedOf(inst, "Destroyed"),
                useCount->signedValue};
    }
    ADD_FAILURE() << "no statistics of " << providerClass;
    return {};
}

TEST_F(BrokerTest, FactoriesShareProviderObjectsExactlyAsTheirBaseObjectsDo) {
    const ProviderStats linksBefore = statsOf(broker, "WidgetGadgetProvider");
    const ProviderStats eventsBefore = statsOf(broker, "EventProvider");
    struct Touch {
        const char *provider;
        InterfaceKind kind;
        int lines;
    };
    const Touch touches[] = {
        {"WidgetGadgetProvider", InterfaceKind::Association, 0},
        {"WidgetGadgetProvider", InterfaceKind::Instance, 1},
        {"EventProvider", InterfaceKind::Indication, 0},
        {"EventStore", InterfaceKind::Instance, 1},
    };
    for (const Touch &t : touches) {
        SCOPED_TRACE(t.provider);
        std::string error;
        testing::internal::CaptureStderr();
        void *first = broker.managementInterface(t.provider, t.kind, &error);
        void *again = broker.managementInterface(t.provider, t.kind, &error);
        const std::string written = testing::internal::GetCapturedStderr();
        EXPECT_NE(first, nullptr) << error;
        EXPECT_EQ(again, first);
        EXPECT_EQ(written, factoryLines(t.lines));
    }

    const ProviderStats links = statsOf(broker, "WidgetGadgetProvider");
    EXPECT_EQ(links.constructed - linksBefore.constructed, 1u);
    EXPECT_EQ(links.initialized - linksBefore.initialized, 1u);
    EXPECT_EQ(links.useCount, 2);
    const ProviderStats events = statsOf(broker, "EventProvider");
    EXPECT_EQ(events.constructed - eventsBefore.constructed, 2u);
    EXPECT_EQ(events.initialized - eventsBefore.initialized, 2u);
    EXPECT_EQ(events.useCount, 2);
}

struct Unload {
    void operator()(void *library) const { dlclose(library); }
};

TEST_F(BrokerTest, InstanceFactoryReturnsItsOneInterfaceAndWritesItsLineEveryCall) {
    testing::internal::CaptureStderr();
    const Response firstUse = broker.enumInstanceNames(classPath("Test_Widget"));
    EXPECT_EQ(testing::internal::GetCapturedStderr(), factoryLines(1));
    ASSERT_TRUE(firstUse.ok()) << firstUse.message.value_or("");

    // RTLD_NOLOAD: the library the broker loaded, not a second copy.
    const std::unique_ptr<void, Unload> library(dlopen(kProviderLibrary, RTLD_NOW | RTLD_NOLOAD));
    ASSERT_NE(library, nullptr) << dlerror();
    using Factory = CMPIInstanceMI *(*)(CMPIBroker *, const CMPIContext *, CMPIStatus *);
    const auto factory = reinterpret_cast<Factory>(dlsym(library.get(), "WidgetProvider_Create_InstanceMI"));
    ASSERT_NE(factory, nullptr) << dlerror();

    auto *mb = const_cast<CMPIBroker *>(broker.cmpiBroker());
    const CMPIContext *ctx = broker.newContext(kNs);
    CMPIStatus rc{CMPI_RC_OK, nullptr};
    testing::internal::CaptureStderr();
    CMPIInstanceMI *once = factory(mb, ctx, &rc);
    CMPIInstanceMI *twice = factory(mb, ctx, &rc);
    EXPECT_EQ(testing::internal::GetCapturedStderr(), factoryLines(2));
    ASSERT_NE(once, nullptr);
    EXPECT_EQ(twice, once);
    EXPECT_EQ(broker.managementInterface("WidgetProvider", InterfaceKind::Instance), once);

    // Each call took a use; handing both back leaves only the broker's, so
    // shutdown still frees the provider.
    for (CMPIInstanceMI *mi : {once, twice}) EXPECT_EQ(mi->ft->cleanup(mi, ctx, 0).rc, CMPI_RC_OK);
    EXPECT_EQ(statsOf(broker, "WidgetProvider").useCount, 1);
}

// A provider that must never unload refuses a non-terminating cleanup, and
// the binding keeps it, still usable, with its use untouched.
TEST_F(BrokerTest, CleanupWithoutTerminationKeepsAProviderThatNeverUnloads) {
    auto *events = static_cast<CMPIIndicationMI *>(broker.managementInterface("EventProvider", InterfaceKind::Indication));
    ASSERT_NE(events, nullptr);
    EXPECT_EQ(events->ft->cleanup(events, broker.newContext(kNs), 0).rc, CMPI_RC_NEVER_UNLOAD);
    EXPECT_EQ(statsOf(broker, "EventProvider").useCount, 1);

    broker.subscribe(sink.subscriber(true));
    ASSERT_TRUE(broker.enableIndications(kNs, "Test_Event").ok());
    EXPECT_TRUE(sink.waitFor(1));
    EXPECT_TRUE(broker.disableIndications(kNs, "Test_Event").ok());
}

TEST_F(BrokerTest, ProvidersThatCannotLoadAnswerFailedNamingTheCause) {
    struct Case {
        const char *cls;
        const char *named;
    };
    const Case cases[] = {
        {"Test_Missing", "tvxnosuchlibrary"},
        {"Test_NoFactory", "NoSuchProvider_Create_InstanceMI"},
        {"Test_NullFactory", "NullProvider"},
        {"Test_ThrowingFactory", "ThrowingProvider"},
    };
    for (const Case &c : cases) {
        SCOPED_TRACE(c.cls);
        const Response first = broker.enumInstanceNames(classPath(c.cls));
        const Response again = broker.enumInstanceNames(classPath(c.cls));
        EXPECT_EQ(first.rc, CMPI_RC_ERR_FAILED);
        EXPECT_THAT(first.message, Optional(AllOf(HasSubstr(c.named), Not(HasSubstr("\n")))));
        EXPECT_EQ(again.rc, first.rc);
        EXPECT_EQ(again.message, first.message);
    }

    EXPECT_EQ(broker.enumInstanceNames(classPath("Test_Widget")).paths.size(), 3u);
    const ProviderStats throwing = statsOf(broker, "ThrowingProvider");
    EXPECT_GE(throwing.constructed, 1u);
    EXPECT_EQ(throwing.destroyed, throwing.constructed);
    EXPECT_EQ(throwing.initialized, 0u);
    EXPECT_EQ(throwing.useCount, 0);
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
    auto *widgetsAsIndication = reinterpret_cast<CMPIIndicationMI *>(widgets);

    struct Case {
        const char *call;
        std::function<CMPIStatus()> run;
    };
    const Case cases[] = {
        {"instance entry, null interface",
         [&] { return widgets->ft->enumerateInstanceNames(nullptr, ctx, nullptr, nullptr); }},
        {"instance entry, interface without a provider",
         [&] { return widgets->ft->getInstance(&noProvider, ctx, nullptr, nullptr, nullptr); }},
        {"cleanup, null interface", [&] { return widgets->ft->cleanup(nullptr, ctx, 1); }},
        {"association entry, instance-only provider",
         [&] { return links->ft->references(widgetsAsAssociation, ctx, nullptr, nullptr, nullptr, nullptr, nullptr); }},
        {"indication entry, instance-only provider",
         [&] { return events->ft->enableIndications(widgetsAsIndication, ctx); }},
    };
    for (const Case &c : cases) {
        SCOPED_TRACE(c.call);
        EXPECT_EQ(c.run().rc, CMPI_RC_ERR_INVALID_HANDLE);
    }
}

}  // namespace
}  // namespace brokertest
