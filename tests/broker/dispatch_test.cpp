// Requests through the broker reach the test providers, and what they answer,
// statuses included, comes back unchanged. That names and instances agree for
// every class, and that a provider that cannot be loaded fails each request,
// is the consistency suite's.
#include <functional>

#include "BrokerFixture.h"

namespace brokertest {
namespace {

using testing::_;
using testing::AllOf;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Matcher;
using testing::Not;
using testing::Optional;

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
        {"a provider constructor throwing", [&] { return broker.enumInstanceNames(classPath("Test_ThrowingFactory")); },
         CMPI_RC_ERR_FAILED, Optional(AllOf(HasSubstr("ThrowingProvider"), Not(HasSubstr("\n"))))},
        {"createInstance throwing a status", [&] { return broker.createInstance(widget("alpha"), alpha); },
         CMPI_RC_ERR_ALREADY_EXISTS, Optional(std::string("widget exists"))},
        {"setInstance throwing std::runtime_error",
         [&] { return broker.setInstance(widget("alpha"), alpha, std::nullopt); }, CMPI_RC_ERR_FAILED,
         Optional(std::string("set failed"))},
        {"deleteInstance left to the binding", [&] { return broker.deleteInstance(widget("alpha")); },
         CMPI_RC_ERR_NOT_SUPPORTED, _},
        {"execQuery throwing an int",
         [&] { return broker.execQuery(classPath("Test_Widget"), "SELECT * FROM Test_Widget", "WQL"); },
         CMPI_RC_ERR_FAILED, Optional(Not(IsEmpty()))},
        {"getInstance of an unknown widget", [&] { return broker.getInstance(widget("x"), std::nullopt); },
         CMPI_RC_ERR_NOT_FOUND, Optional(std::string("no widget x"))},
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
    EXPECT_DEATH(broker.getInstance(gadget("vanishing"), std::nullopt), "answered OK without an instance");
}

// An unregistered superclass reaches the providers of its subclasses, and
// up-calls reach subclasses too; association filters reach the provider in
// their places from either end, and a result class matches its subclasses.
// Names and instances must agree, since each provider derives one from the
// other. Property lists, and the objects every request must free, show in
// the product's broker tests.
TEST_F(BrokerTest, EnumerationsAndWalksReachExactlyWhatIsAskedFor) {
    const ObjectPath gamma = widget("gamma", "Test_SpecialWidget");
    enum Kind { Enumeration, Associators, References };
    struct Walk {
        const char *what;
        Kind kind;
        ObjectPath from;
        std::string assocClass, resultClass, role, resultRole;
        std::vector<ObjectPath> reached;
    };
    const Walk walks[] = {
        {"the root of the widget classes", Enumeration, classPath("Test_ManagedElement"), "", "", "", "",
         {widget("alpha"), widget("beta"), gamma}},
        {"gadgets, one per widget an up-call finds", Enumeration, classPath("Test_Gadget"), "", "", "", "",
         {gadget("alpha"), gadget("beta"), gadget("gamma")}},
        {"associators through the association class to a result superclass", Associators, gadget("gamma"),
         "Test_WidgetGadget", "Test_ManagedElement", "", "", {gamma}},
        {"associators by both roles from a subclassed widget", Associators, gamma, "", "Test_Gadget", "Owner",
         "Part", {gadget("gamma")}},
        {"references of the association class in the gadget's role", References, gadget("beta"), "",
         "Test_WidgetGadget", "Part", "", {link(widget("beta"), gadget("beta"))}},
    };
    for (const Walk &w : walks) {
        SCOPED_TRACE(w.what);
        Response names, instances;
        if (w.kind == Enumeration) {
            names = broker.enumInstanceNames(w.from);
            instances = broker.enumInstances(w.from, std::nullopt);
        } else if (w.kind == References) {
            names = broker.referenceNames(w.from, w.resultClass, w.role);
            instances = broker.references(w.from, w.resultClass, w.role, std::nullopt);
        } else {
            names = broker.associatorNames(w.from, w.assocClass, w.resultClass, w.role, w.resultRole);
            instances = broker.associators(w.from, w.assocClass, w.resultClass, w.role, w.resultRole, std::nullopt);
        }
        ASSERT_TRUE(names.ok() && instances.ok()) << names.message.value_or("") << instances.message.value_or("");
        EXPECT_EQ(texts(names.paths), texts(w.reached));
        EXPECT_EQ(texts(instances.instances), texts(w.reached));
    }
}

}  // namespace
}  // namespace brokertest
