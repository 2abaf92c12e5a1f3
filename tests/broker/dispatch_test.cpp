// What the test providers answer, statuses included, comes back through the
// broker unchanged. That names and instances agree for every class, and that
// a provider that cannot be loaded fails each request, is the consistency
// suite's; that a superclass or up-call reaches the providers of subclasses,
// and a result class its subclasses, the latched-health and association
// tests of the product's providers show.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <functional>

#include "core/Broker.h"

namespace {

using namespace tvxbroker;
using testing::_;
using testing::AllOf;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Matcher;
using testing::Not;
using testing::Optional;

constexpr const char *kNs = "root/cimv2";

ObjectPath keyed(const char *cls, const char *key, const std::string &value) {
    return ObjectPath{"", kNs, cls, {{key, CimValue::makeString(value)}}};
}

ObjectPath widget(const std::string &name) { return keyed("Test_Widget", "Name", name); }

class BrokerTest : public testing::Test {
protected:
    Broker broker{loadBrokerConfig({TVX_TESTPROVIDER_DIR}, {TVX_TESTPROVIDER_REG}, {TVX_TESTPROVIDER_MOF})};
};

// Asked twice, each request fails the same way.
TEST_F(BrokerTest, EveryStatusReachesTheCallerUnchanged) {
    const Instance alpha{widget("alpha"), {{"Size", CimValue::makeUnsigned(CMPI_uint32, 5)}}};
    struct Case {
        const char *request;
        std::function<Response()> call;
        CMPIrc rc;
        Matcher<std::optional<std::string>> message;
    };
    const Case cases[] = {
        {"a provider constructor throwing",
         [&] { return broker.enumInstanceNames(ObjectPath{"", kNs, "Test_ThrowingFactory", {}}); },
         CMPI_RC_ERR_FAILED, Optional(AllOf(HasSubstr("ThrowingProvider"), Not(HasSubstr("\n"))))},
        {"createInstance throwing a status", [&] { return broker.createInstance(widget("alpha"), alpha); },
         CMPI_RC_ERR_ALREADY_EXISTS, Optional(std::string("widget exists"))},
        {"setInstance throwing std::runtime_error",
         [&] { return broker.setInstance(widget("alpha"), alpha, std::nullopt); }, CMPI_RC_ERR_FAILED,
         Optional(std::string("set failed"))},
        {"execQuery throwing an int",
         [&] { return broker.execQuery(ObjectPath{"", kNs, "Test_Widget", {}}, "SELECT * FROM Test_Widget", "WQL"); },
         CMPI_RC_ERR_FAILED, Optional(Not(IsEmpty()))},
        {"associatorNames failing in an up-call",
         [&] { return broker.associatorNames(widget("x"), "", "", "", ""); }, CMPI_RC_ERR_NOT_FOUND,
         Optional(std::string("no widget x"))},
        {"getInstance answered OK with nothing, as sfcb tells a client",
         [&] { return broker.getInstance(widget("vanishing"), std::nullopt); }, CMPI_RC_ERR_NOT_FOUND, _},
        {"a subscription to a class sfcb does not forward",
         [&] { return broker.activateFilter(kNs, "CIM_Indication", "SELECT * FROM CIM_Indication", true); },
         CMPI_RC_ERR_NOT_SUPPORTED,
         Optional(std::string("No supported indication classes in filter query or no provider found"))},
    };
    for (const Case &c : cases) {
        SCOPED_TRACE(c.request);
        const Response response = c.call();
        EXPECT_EQ(response.rc, c.rc);
        EXPECT_THAT(response.message, c.message);
        const Response again = c.call();
        EXPECT_EQ(again.rc, response.rc);
        EXPECT_EQ(again.message, response.message);
    }
}

// sfcb takes the first answer of an up-call getInstance unseen, and its
// provider process dies when the answer is OK with nothing.
using BrokerDeathTest = BrokerTest;
TEST_F(BrokerDeathTest, AnUpCallGetInstanceAnsweredOkWithNothingEndsTheProcess) {
    EXPECT_DEATH(broker.getInstance(keyed("Test_Gadget", "Id", "gadget-vanishing"), std::nullopt),
                 "answered OK without an instance");
}

}  // namespace
