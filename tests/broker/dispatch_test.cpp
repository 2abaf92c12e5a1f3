// Requests through the broker reach the test providers, and what they answer,
// statuses included, comes back unchanged: instance operations, property
// lists, subclasses, both result filters, up-calls and association walks.
#include <functional>

#include "BrokerFixture.h"

namespace brokertest {
namespace {

using testing::_;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Matcher;
using testing::Not;
using testing::Optional;

TEST_F(BrokerTest, EveryStatusReachesTheCallerUnchanged) {
    const Instance alpha{widget("alpha"), {{"Size", CimValue::makeUnsigned(CMPI_uint32, 5)}}};
    struct Case {
        const char *request;
        std::function<Response()> call;
        CMPIrc rc;
        Matcher<std::optional<std::string>> message;
    };
    const Case cases[] = {
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
        {"getInstance of a malformed gadget id",
         [&] { return broker.getInstance(keyed("Test_Gadget", "Id", "bogus"), std::nullopt); },
         CMPI_RC_ERR_NOT_FOUND, Optional(std::string("no gadget bogus"))},
        {"associatorNames failing in an up-call",
         [&] { return broker.associatorNames(widget("x"), "", "", "", ""); }, CMPI_RC_ERR_NOT_FOUND,
         Optional(std::string("no widget x"))},
    };
    for (const Case &c : cases) {
        SCOPED_TRACE(c.request);
        const Response response = c.call();
        EXPECT_EQ(response.rc, c.rc);
        EXPECT_THAT(response.message, c.message);
    }
}

TEST_F(BrokerTest, ValuesOfEveryKindCrossTheCAbiIntact) {
    const Response response = broker.getInstance(widget("gamma"), std::nullopt);
    ASSERT_TRUE(response.ok()) << response.message.value_or("");
    ASSERT_EQ(response.instances.size(), 1u);
    const Instance &gamma = response.instances[0];
    EXPECT_EQ(formatPath(gamma.path), formatPath(widget("gamma", "Test_SpecialWidget")));

    const CimValue *caption = gamma.property("Caption");
    const CimValue *size = gamma.property("Size");
    const CimValue *tags = gamma.property("Tags");
    const CimValue *created = gamma.property("Created");
    const CimValue *enabled = gamma.property("Enabled");
    ASSERT_TRUE(caption && size && tags && created && enabled);
    EXPECT_EQ(caption->text, "Widget gamma");
    EXPECT_EQ(size->type, CMPI_uint32);
    EXPECT_EQ(size->unsignedValue, 3u);
    EXPECT_EQ(tags->type, CMPI_stringA);
    EXPECT_THAT(tags->elements, ElementsAre(CimValue::makeString("test"), CimValue::makeString("gamma")));
    EXPECT_EQ(created->dateTime, (DateTime{1577836803000000ULL, false}));
    EXPECT_EQ(enabled->type, CMPI_boolean);
    EXPECT_TRUE(enabled->boolean);
}

TEST_F(BrokerTest, PropertyListsKeepOnlyTheListedProperties) {
    const std::vector<std::string> optional = {"Caption", "Size", "Tags", "Created", "Enabled"};
    struct Case {
        PropertyList list;
        std::vector<std::string> present;
    };
    const Case cases[] = {
        {std::nullopt, optional},
        {std::vector<std::string>{"Size"}, {"Size"}},
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

TEST_F(BrokerTest, EnumeratingAClassReachesItsSubclasses) {
    const std::vector<std::string> everyWidget =
        texts({widget("alpha"), widget("beta"), widget("gamma", "Test_SpecialWidget")});
    struct Case {
        const char *cls;
        std::vector<std::string> expected;
    };
    const Case cases[] = {
        {"Test_ManagedElement", everyWidget},
        {"Test_Widget", everyWidget},
        {"Test_SpecialWidget", texts({widget("gamma", "Test_SpecialWidget")})},
    };
    for (const Case &c : cases) {
        SCOPED_TRACE(c.cls);
        const Response response = broker.enumInstances(classPath(c.cls), std::nullopt);
        ASSERT_TRUE(response.ok()) << response.message.value_or("");
        EXPECT_EQ(texts(response.instances), c.expected);
    }
}

// Each provider derives one of enumInstances and enumInstanceNames from the
// other through a result filter, so the two must always agree.
TEST_F(BrokerTest, InstanceNamesAreThePathsOfTheInstances) {
    const ObjectPath gamma = widget("gamma", "Test_SpecialWidget");
    struct Case {
        const char *cls;
        std::vector<std::string> expected;
    };
    const Case cases[] = {
        {"Test_Widget", texts({widget("alpha"), widget("beta"), gamma})},
        {"Test_Gadget", texts({gadget("alpha"), gadget("beta"), gadget("gamma")})},
        {"Test_WidgetGadget", texts({link(widget("alpha"), gadget("alpha")), link(widget("beta"), gadget("beta")),
                                     link(gamma, gadget("gamma"))})},
        {"Test_EventCounter", texts({keyed("Test_EventCounter", "Name", "events")})},
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

TEST_F(BrokerTest, GadgetsAreBuiltFromWidgetsFoundByUpCalls) {
    const Response response = broker.enumInstances(classPath("Test_Gadget"), std::nullopt);
    ASSERT_TRUE(response.ok()) << response.message.value_or("");
    std::vector<std::string> widgetNames;
    for (const Instance &inst : response.instances) {
        const CimValue *id = inst.property("Id");
        const CimValue *widgetName = inst.property("WidgetName");
        ASSERT_TRUE(id && widgetName) << formatPath(inst.path);
        EXPECT_EQ(id->text, "gadget-" + widgetName->text);
        widgetNames.push_back(widgetName->text);
    }
    EXPECT_THAT(widgetNames, testing::UnorderedElementsAre("alpha", "beta", "gamma"));
}

struct Walk {
    const char *what;
    ObjectPath from;
    std::string assocClass, resultClass, role, resultRole;
    std::vector<ObjectPath> reached;
};

TEST_F(BrokerTest, AssociatorsReachTheFarEndFromEitherEnd) {
    const ObjectPath gamma = widget("gamma", "Test_SpecialWidget");
    const Walk walks[] = {
        {"widget to its gadget", widget("alpha"), "", "", "", "", {gadget("alpha")}},
        {"gadget to its widget, in the widget's own class", gadget("gamma"), "", "", "", "", {gamma}},
        {"widget named by its subclass", gamma, "", "", "", "", {gadget("gamma")}},
        {"through the association class", widget("alpha"), "Test_WidgetGadget", "", "", "", {gadget("alpha")}},
        {"to the result class", widget("beta"), "", "Test_Gadget", "", "", {gadget("beta")}},
        {"to a result superclass", gadget("gamma"), "", "Test_ManagedElement", "", "", {gamma}},
        {"to a result class the far end is not", widget("beta"), "", "Test_Widget", "", "", {}},
        {"by both roles", widget("alpha"), "", "", "Owner", "Part", {gadget("alpha")}},
        {"by the wrong role", widget("alpha"), "", "", "Part", "", {}},
        {"by the wrong result role", gadget("beta"), "", "", "", "Part", {}},
    };
    for (const Walk &w : walks) {
        SCOPED_TRACE(w.what);
        const Response names = broker.associatorNames(w.from, w.assocClass, w.resultClass, w.role, w.resultRole);
        const Response instances =
            broker.associators(w.from, w.assocClass, w.resultClass, w.role, w.resultRole, std::nullopt);
        ASSERT_TRUE(names.ok() && instances.ok()) << names.message.value_or("") << instances.message.value_or("");
        EXPECT_EQ(texts(names.paths), texts(w.reached));
        EXPECT_EQ(texts(instances.instances), texts(w.reached));
    }
}

TEST_F(BrokerTest, ReferencesReturnTheLinkFromEitherEnd) {
    const ObjectPath gamma = widget("gamma", "Test_SpecialWidget");
    const Walk walks[] = {
        {"from a widget", widget("alpha"), "", "", "", "", {link(widget("alpha"), gadget("alpha"))}},
        {"from a gadget of a subclassed widget", gadget("gamma"), "", "", "", "", {link(gamma, gadget("gamma"))}},
        {"of the association class", widget("beta"), "", "Test_WidgetGadget", "", "", {link(widget("beta"), gadget("beta"))}},
        {"in the gadget's role", gadget("beta"), "", "", "Part", "", {link(widget("beta"), gadget("beta"))}},
        {"in a role the gadget does not play", gadget("beta"), "", "", "Owner", "", {}},
    };
    for (const Walk &w : walks) {
        SCOPED_TRACE(w.what);
        const Response names = broker.referenceNames(w.from, w.resultClass, w.role);
        const Response instances = broker.references(w.from, w.resultClass, w.role, std::nullopt);
        ASSERT_TRUE(names.ok() && instances.ok()) << names.message.value_or("") << instances.message.value_or("");
        EXPECT_EQ(texts(names.paths), texts(w.reached));
        EXPECT_EQ(texts(instances.instances), texts(w.reached));
        for (const Instance &inst : instances.instances) {
            const CimValue *owner = inst.property("Owner");
            const CimValue *part = inst.property("Part");
            ASSERT_TRUE(owner && owner->reference && part && part->reference);
            EXPECT_EQ(formatPath(link(*owner->reference, *part->reference)), formatPath(inst.path));
        }
    }
}

}  // namespace
}  // namespace brokertest
