// The four association operations of OMC::SimpleAssociationMI, through the
// embedded broker, on a provider whose doReferences ignores every filter
// and rebuilds every reference without a namespace (assocprovider/).
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <string>
#include <vector>

#include "OmcTestBroker.h"
#include "model/PathText.h"

namespace {

using namespace tvxbroker;

ObjectPath object(const char *className, const char *name, const char *ns = "root/cimv2") {
    const char *key = std::string(className) == "Test_System" ? "Name" : "DeviceID";
    return ObjectPath{"", ns, className, {{key, CimValue::makeString(name)}}};
}

ObjectPath system(const char *name) { return object("Test_System", name); }

// A reference name: the association keyed by its references as the provider set them.
ObjectPath link(const char *assocClass, const char *system, const char *deviceClass, const char *device) {
    return ObjectPath{"", "root/cimv2", assocClass,
                      {{"Antecedent", CimValue::makeReference(object("Test_System", system, ""))},
                       {"Dependent", CimValue::makeReference(object(deviceClass, device, ""))}}};
}

std::vector<std::string> texts(const std::vector<ObjectPath> &paths) {
    std::vector<std::string> result;
    for (const ObjectPath &path : paths) result.push_back(formatPath(path));
    std::sort(result.begin(), result.end());
    return result;
}

std::vector<std::string> texts(const std::vector<Instance> &instances) {
    std::vector<ObjectPath> paths;
    for (const Instance &instance : instances) paths.push_back(instance.path);
    return texts(paths);
}

class SimpleAssociation : public testing::Test {
protected:
    Broker broker{omctest::omcTestConfig()};
};

TEST_F(SimpleAssociation, AssociatorNamesFollowEveryFilter) {
    const std::vector<ObjectPath> fromAlpha = {object("Test_Disk", "disk0"), object("Test_Device", "nic0"),
                                               object("Test_Disk", "ghost"), object("Test_Disk", "disk1")};
    const std::vector<ObjectPath> fromDisk0 = {system("alpha"), system("beta")};
    struct Case {
        ObjectPath source;
        const char *assocClass, *resultClass, *role, *resultRole;
        std::vector<ObjectPath> farEnds;
    };
    const Case cases[] = {
        {system("alpha"), "", "", "", "", fromAlpha},
        {system("alpha"), "Test_SystemDevice", "", "", "", fromAlpha},
        {system("alpha"), "Test_SpareDevice", "", "", "", {object("Test_Disk", "disk1")}},
        {system("alpha"), "", "Test_Disk", "", "", {fromAlpha[0], fromAlpha[2], fromAlpha[3]}},
        {system("alpha"), "", "Test_System", "", "", {}},
        {system("alpha"), "", "", "antecedent", "DEPENDENT", fromAlpha},
        {system("alpha"), "", "", "Dependent", "", {}},
        {system("alpha"), "", "", "", "Antecedent", {}},
        {ObjectPath{"", "root/cimv2", "TEST_SYSTEM", {{"name", CimValue::makeString("alpha")}}}, "", "", "", "",
         fromAlpha},
        {object("Test_Disk", "disk0"), "", "", "Dependent", "Antecedent", fromDisk0},
        {object("Test_Device", "disk0"), "", "", "", "", fromDisk0},
        {object("Test_Disk", "disk0"), "", "", "Antecedent", "", {}},
        {system("lonely"), "", "", "", "", {}},
    };
    for (const Case &c : cases) {
        SCOPED_TRACE(formatPath(c.source) + " " + c.assocClass + " " + c.resultClass + " " + c.role +
                     " " + c.resultRole);
        const Response names = broker.associatorNames(c.source, c.assocClass, c.resultClass, c.role, c.resultRole);
        ASSERT_TRUE(names.ok()) << names.message.value_or("");
        EXPECT_EQ(texts(names.paths), texts(c.farEnds));
        EXPECT_TRUE(names.done);
    }
}

TEST_F(SimpleAssociation, AssociatorsFetchFarEndsWithThePropertyListAndSkipMissingOnes) {
    const Response all = broker.associators(system("alpha"), "", "", "", "", PropertyList{{"Size"}});
    ASSERT_TRUE(all.ok()) << all.message.value_or("");
    EXPECT_EQ(texts(all.instances),
              texts({object("Test_Disk", "disk0"), object("Test_Device", "nic0"), object("Test_Disk", "disk1")}));
    for (const Instance &device : all.instances) {
        EXPECT_NE(device.property("Size"), nullptr);
        EXPECT_EQ(device.property("Model"), nullptr);
    }
    const Response disks = broker.associators(system("alpha"), "", "Test_Disk", "", "", std::nullopt);
    ASSERT_TRUE(disks.ok()) << disks.message.value_or("");
    EXPECT_EQ(texts(disks.instances), texts({object("Test_Disk", "disk0"), object("Test_Disk", "disk1")}));
    ASSERT_FALSE(disks.instances.empty());
    EXPECT_NE(disks.instances[0].property("Model"), nullptr);
}

TEST_F(SimpleAssociation, ReferencesAndTheirNamesAgreeUnderEveryFilter) {
    const std::vector<ObjectPath> ofAlpha = {link("Test_HostedDevice", "alpha", "Test_Disk", "disk0"),
                                             link("Test_HostedDevice", "alpha", "Test_Device", "nic0"),
                                             link("Test_HostedDevice", "alpha", "Test_Disk", "ghost"),
                                             link("Test_SpareDevice", "alpha", "Test_Disk", "disk1")};
    struct Case {
        ObjectPath source;
        const char *resultClass, *role;
        std::vector<ObjectPath> names;
    };
    const Case cases[] = {
        {system("alpha"), "", "", ofAlpha},
        {system("alpha"), "Test_SystemDevice", "ANTECEDENT", ofAlpha},
        {system("alpha"), "Test_SpareDevice", "", {ofAlpha[3]}},
        {system("alpha"), "", "Dependent", {}},
        {object("Test_Disk", "disk0"), "", "Dependent",
         {ofAlpha[0], link("Test_HostedDevice", "beta", "Test_Disk", "disk0")}},
    };
    for (const Case &c : cases) {
        SCOPED_TRACE(formatPath(c.source) + " " + c.resultClass + " " + c.role);
        const Response names = broker.referenceNames(c.source, c.resultClass, c.role);
        const Response instances = broker.references(c.source, c.resultClass, c.role, std::nullopt);
        ASSERT_TRUE(names.ok() && instances.ok());
        EXPECT_EQ(texts(names.paths), texts(c.names));
        EXPECT_EQ(texts(instances.instances), texts(c.names));
        for (const Instance &association : instances.instances) {
            // The provider reuses one instance for all its answers: each
            // answer must still be the one it was when returned.
            const CimValue *note = association.property("Note");
            ASSERT_NE(note, nullptr);
            EXPECT_EQ(note->text, association.property("Dependent")->reference->keys.at(0).value.text);
        }
    }
}

TEST_F(SimpleAssociation, ReferencesKeepTheListedPropertiesAndTheReferences) {
    const std::vector<std::string> all = {"Antecedent", "Dependent", "Note"};
    const std::pair<PropertyList, std::vector<std::string>> cases[] = {
        {std::nullopt, all},
        {PropertyList{{"note"}}, all},
        {PropertyList{std::vector<std::string>{}}, {"Antecedent", "Dependent"}},
    };
    for (const auto &[properties, kept] : cases) {
        const Response response = broker.references(system("alpha"), "", "", properties);
        ASSERT_EQ(response.instances.size(), 4U) << response.message.value_or("");
        for (const Instance &association : response.instances) {
            std::vector<std::string> names;
            for (const NamedValue &property : association.properties) names.push_back(property.name);
            EXPECT_THAT(names, testing::UnorderedElementsAreArray(kept));
        }
    }
}

TEST_F(SimpleAssociation, EveryOperationAnswersNothingForALonelySourceAndOnlyTheStatusOnFailure) {
    const std::function<Response(const ObjectPath &)> operations[] = {
        [&](const ObjectPath &source) { return broker.associators(source, "", "", "", "", std::nullopt); },
        [&](const ObjectPath &source) { return broker.associatorNames(source, "", "", "", ""); },
        [&](const ObjectPath &source) { return broker.references(source, "", "", std::nullopt); },
        [&](const ObjectPath &source) { return broker.referenceNames(source, "", ""); },
    };
    for (const auto &operation : operations) {
        const Response lonely = operation(system("lonely"));
        EXPECT_TRUE(lonely.ok() && lonely.done);
        EXPECT_TRUE(lonely.instances.empty() && lonely.paths.empty());

        const Response broken = operation(system("broken"));
        EXPECT_EQ(broken.rc, CMPI_RC_ERR_FAILED);
        EXPECT_EQ(broken.message.value_or(""), "broken system");
        EXPECT_FALSE(broken.done);
        EXPECT_TRUE(broken.instances.empty() && broken.paths.empty());
    }
}

}  // namespace
