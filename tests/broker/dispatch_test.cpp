// Requests through the broker reach the test providers, and what they answer,
// statuses included, comes back unchanged, leaving no broker object behind:
// instance operations, property lists, subclasses, both result filters,
// up-calls and association walks. How values of each kind read shows in
// tvxcim's output tests, and that names and instances agree for every class
// in the consistency suite.
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

// Asked twice, each request fails the same way: a provider that could not be
// loaded stays failed, and leaves the others working.
TEST_F(BrokerTest, EveryStatusReachesTheCallerUnchanged) {
    const Instance alpha{widget("alpha"), {{"Size", CimValue::makeUnsigned(CMPI_uint32, 5)}}};
    const auto failedNaming = [](const char *cause) {
        return Optional(AllOf(HasSubstr(cause), Not(HasSubstr("\n"))));
    };
    const auto names = [this](const char *cls) {
        return [this, cls] { return broker.enumInstanceNames(classPath(cls)); };
    };
    struct Case {
        const char *request;
        std::function<Response()> call;
        CMPIrc rc;
        Matcher<std::optional<std::string>> message;
    };
    const Case cases[] = {
        {"a provider library that does not exist", names("Test_Missing"), CMPI_RC_ERR_FAILED,
         failedNaming("tvxnosuchlibrary")},
        {"a factory missing from the library", names("Test_NoFactory"), CMPI_RC_ERR_FAILED,
         failedNaming("NoSuchProvider_Create_InstanceMI")},
        {"a factory returning no interface", names("Test_NullFactory"), CMPI_RC_ERR_FAILED,
         failedNaming("NullProvider")},
        {"a provider constructor throwing", names("Test_ThrowingFactory"), CMPI_RC_ERR_FAILED,
         failedNaming("ThrowingProvider")},
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
        {"getInstance without the key", [&] { return broker.getInstance(classPath("Test_Widget"), std::nullopt); },
         CMPI_RC_ERR_INVALID_PARAMETER, Optional(std::string("Name key missing"))},
        {"getInstance failing in an up-call", [&] { return broker.getInstance(gadget("x"), std::nullopt); },
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

TEST_F(BrokerTest, RequestsFreeTheBrokerObjectsTheyMake) {
    const std::size_t idle = broker.liveObjectCount();
    for (const char *cls : {"Test_Widget", "Test_Gadget", "Test_WidgetGadget", "Test_ProviderStats"}) {
        ASSERT_TRUE(broker.enumInstances(classPath(cls), std::nullopt).ok()) << cls;
    }
    ASSERT_TRUE(broker.associators(widget("alpha"), "", "", "", "", std::nullopt).ok());
    ASSERT_EQ(broker.getInstance(widget("x"), std::nullopt).rc, CMPI_RC_ERR_NOT_FOUND);
    EXPECT_EQ(broker.liveObjectCount(), idle);
}

TEST_F(BrokerTest, PropertyListsKeepOnlyTheListedProperties) {
    const std::vector<std::string> optional = {"Caption", "Size", "Tags", "Created", "Enabled"};
    struct Case {
        PropertyList list;
        std::vector<std::string> present;
    };
    const Case cases[] = {
        {std::nullopt, optional},
        {std::vector<std::string>{"caption", "ENABLED"}, {"Caption", "Enabled"}},
        {std::vector<std::string>{}, {}},
    };
    for (const Case &c : cases) {
        SCOPED_TRACE(c.list ? testing::PrintToString(*c.list) : "no list");
        const Response all = broker.enumInstances(classPath("Test_Widget"), c.list);
        const Response one = broker.getInstance(widget("beta"), c.list);
        ASSERT_TRUE(all.ok() && one.ok());
        std::vector<Instance> instances = all.instances;
        instances.insert(instances.end(), one.instances.begin(), one.instances.end());
        ASSERT_EQ(instances.size(), 4u);
        for (const Instance &inst : instances) {
            for (const std::string &property : optional) {
                const bool listed = std::find(c.present.begin(), c.present.end(), property) != c.present.end();
                EXPECT_EQ(inst.property(property) != nullptr, listed) << formatPath(inst.path) << " " << property;
            }
        }
    }
}

// Each provider derives one of enumInstances and enumInstanceNames from the
// other through a result filter, so the two must always agree.
TEST_F(BrokerTest, EnumerationReachesSubclassesAndWhatUpCallsFind) {
    const ObjectPath gamma = widget("gamma", "Test_SpecialWidget");
    const std::vector<std::string> everyWidget = texts({widget("alpha"), widget("beta"), gamma});
    struct Case {
        const char *cls;
        std::vector<std::string> expected;
    };
    const Case cases[] = {
        {"Test_ManagedElement", everyWidget},
        {"Test_Widget", everyWidget},
        {"Test_Gadget", texts({gadget("alpha"), gadget("beta"), gadget("gamma")})},
    };
    for (const Case &c : cases) {
        SCOPED_TRACE(c.cls);
        const Response names = broker.enumInstanceNames(classPath(c.cls));
        const Response instances = broker.enumInstances(classPath(c.cls), std::nullopt);
        ASSERT_TRUE(names.ok() && instances.ok()) << names.message.value_or("") << instances.message.value_or("");
        EXPECT_EQ(texts(names.paths), c.expected);
        EXPECT_EQ(texts(instances.instances), c.expected);
    }
}

// Each filter in its place, from either end: a walk that sets several reaches
// nothing if any of them is passed in the wrong position.
TEST_F(BrokerTest, AssociationWalksPassEveryFilterToTheProvider) {
    const ObjectPath gamma = widget("gamma", "Test_SpecialWidget");
    struct Walk {
        const char *what;
        bool references;
        ObjectPath from;
        std::string assocClass, resultClass, role, resultRole;
        std::vector<ObjectPath> reached;
    };
    const Walk walks[] = {
        {"associators through the association class to a result superclass", false, gadget("gamma"),
         "Test_WidgetGadget", "Test_ManagedElement", "", "", {gamma}},
        {"associators by both roles from a subclassed widget", false, gamma, "", "Test_Gadget", "Owner", "Part",
         {gadget("gamma")}},
        {"associators by the wrong role", false, widget("alpha"), "", "", "Part", "", {}},
        {"associators by the wrong result role", false, gadget("beta"), "", "", "", "Part", {}},
        {"references of the association class in the gadget's role", true, gadget("beta"), "", "Test_WidgetGadget",
         "Part", "", {link(widget("beta"), gadget("beta"))}},
        {"references in a role the widget does not play", true, widget("beta"), "", "", "Part", "", {}},
    };
    for (const Walk &w : walks) {
        SCOPED_TRACE(w.what);
        const Response names = w.references ? broker.referenceNames(w.from, w.resultClass, w.role)
                                            : broker.associatorNames(w.from, w.assocClass, w.resultClass, w.role,
                                                                     w.resultRole);
        const Response instances =
            w.references ? broker.references(w.from, w.resultClass, w.role, std::nullopt)
                         : broker.associators(w.from, w.assocClass, w.resultClass, w.role, w.resultRole, std::nullopt);
        ASSERT_TRUE(names.ok() && instances.ok()) << names.message.value_or("") << instances.message.value_or("");
        EXPECT_EQ(texts(names.paths), texts(w.reached));
        EXPECT_EQ(texts(instances.instances), texts(w.reached));
    }
}

}  // namespace
}  // namespace brokertest
