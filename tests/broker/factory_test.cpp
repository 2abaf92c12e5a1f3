// How the broker obtains providers through the binding's factories: objects
// kept apart by their base objects, and the instance factory's
// line on standard error. A provider that never unloads refusing a cleanup
// shows in the heartbeat's tests.
#include "BrokerFixture.h"

namespace brokertest {
namespace {

const std::string kFactoryLine = "--- _Create_InstanceMI() P10CmpiBaseMI\n";

// Initializations and uses of one provider's objects, as Test_ProviderStats
// reports them.
using Stats = std::pair<std::uint64_t, std::int64_t>;
Stats statsOf(Broker &broker, const std::string &provider) {
    for (const Instance &inst : broker.enumInstances(classPath("Test_ProviderStats"), std::nullopt).instances) {
        const CimValue *name = inst.property("ProviderName");
        const CimValue *initialized = inst.property("Initialized");
        const CimValue *useCount = inst.property("UseCount");
        if (name != nullptr && name->text == provider && initialized != nullptr && useCount != nullptr) {
            return {initialized->unsignedValue, useCount->signedValue};
        }
    }
    ADD_FAILURE() << "no statistics of " << provider;
    return {};
}

// Every kind of interface starts with its handle: the provider object.
void *providerObjectOf(void *mi) { return *static_cast<void **>(mi); }

// Factories of different base objects keep their providers apart. Every
// factory call takes a use, and an instance factory writes its line.
TEST_F(BrokerTest, FactoriesOfDifferentBaseObjectsKeepTheirProvidersApart) {
    const struct {
        const char *provider;
        InterfaceKind kind;
        std::string written;
    } touches[] = {
        {"EventProvider", InterfaceKind::Indication, ""},
        {"EventStore", InterfaceKind::Instance, kFactoryLine},
    };
    std::vector<void *> interfaces;
    for (const auto &t : touches) {
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
    EXPECT_NE(providerObjectOf(interfaces[0]), providerObjectOf(interfaces[1])) << "two base objects, two providers";
    EXPECT_EQ(statsOf(broker, "EventProvider"), (Stats{2, 2}));
}

}  // namespace
}  // namespace brokertest
