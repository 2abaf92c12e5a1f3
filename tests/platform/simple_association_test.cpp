// The four association operations of OMC::SimpleAssociationMI, through the
// embedded broker, on a provider whose doReferences ignores every filter
// and rebuilds every reference without a namespace (assocprovider/).
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

#include "core/Broker.h"
#include "model/PathText.h"

namespace {

using namespace tvxbroker;

ObjectPath object(const char *className, const std::string &name) {
    const char *key = std::string(className) == "Test_System" ? "Name" : "DeviceID";
    return ObjectPath{"", "root/cimv2", className, {{key, CimValue::makeString(name)}}};
}

ObjectPath system(const std::string &name) { return object("Test_System", name); }

// Sorted, since the order of the answers is the provider's.
std::vector<std::string> texts(const std::vector<ObjectPath> &paths, const std::vector<Instance> &instances = {}) {
    std::vector<std::string> result;
    for (const ObjectPath &path : paths) result.push_back(formatPath(path));
    for (const Instance &instance : instances) result.push_back(formatPath(instance.path));
    std::sort(result.begin(), result.end());
    return result;
}

enum Operation { associators, associatorNames, references, referenceNames };
const std::vector<Operation> kAllOperations = {associators, associatorNames, references, referenceNames};

class SimpleAssociation : public testing::Test {
protected:
    Response request(Operation operation, const ObjectPath &source, const char *resultClass = "",
                     const PropertyList &properties = std::nullopt) {
        if (operation == associators) return broker.associators(source, "", resultClass, "", "", properties);
        if (operation == associatorNames) return broker.associatorNames(source, "", resultClass, "", "");
        if (operation == references) return broker.references(source, "", "", properties);
        return broker.referenceNames(source, "", "");
    }

    Broker broker{loadBrokerConfig({TVX_OMCTESTPROVIDER_DIR}, {TVX_OMCTESTPROVIDER_REG}, {TVX_OMCTESTPROVIDER_MOF})};
};

// The provider ignores every filter, so the base must apply them (every
// kind of filter, from either end, is the product's association tests'). A
// source without associations gets nothing, a failing one only its status.
TEST_F(SimpleAssociation, EachOperationAnswersWhatItsFiltersLetThrough) {
    const ObjectPath alpha = system("alpha");
    const ObjectPath disk0 = object("Test_Disk", "disk0");
    const ObjectPath disk1 = object("Test_Disk", "disk1");
    const ObjectPath ghost = object("Test_Disk", "ghost");  // linked to, but not served
    const struct {
        std::vector<Operation> operations;
        ObjectPath source;
        const char *resultClass;
        std::vector<ObjectPath> answers;
        CMPIrc rc = CMPI_RC_OK;
        const char *message = "";
    } cases[] = {
        {{associatorNames}, alpha, "", {disk0, object("Test_Device", "nic0"), ghost, disk1}},
        // Only far ends that exist are fetched, whether the source exists or not.
        {{associators}, alpha, "Test_Disk", {disk0, disk1}},
        {{associators}, ghost, "", {alpha}},
        {kAllOperations, system("lonely"), "", {}},
        {kAllOperations, system("broken"), "", {}, CMPI_RC_ERR_FAILED, "broken system"},
    };
    for (const auto &c : cases) {
        for (const Operation operation : c.operations) {
            SCOPED_TRACE(testing::Message() << "operation " << operation << " from " << formatPath(c.source) << " "
                                            << c.resultClass);
            const Response response = request(operation, c.source, c.resultClass);
            EXPECT_EQ(response.rc, c.rc);
            EXPECT_EQ(response.message.value_or(""), c.message);
            EXPECT_EQ(response.done, c.rc == CMPI_RC_OK);
            EXPECT_EQ(texts(response.paths, response.instances), texts(c.answers));
        }
    }
}

TEST_F(SimpleAssociation, AnswersKeepTheListedPropertiesTheKeysAndTheReferences) {
    const std::vector<std::string> association = {"Antecedent", "Dependent", "Note"};
    const struct {
        Operation operation;
        PropertyList properties;
        std::vector<std::string> kept;
    } cases[] = {
        {associators, PropertyList{{"Size"}}, {"DeviceID", "Size"}},
        {references, std::nullopt, association},
        {references, PropertyList{std::vector<std::string>{}}, {"Antecedent", "Dependent"}},
    };
    for (const auto &c : cases) {
        const Response response = request(c.operation, system("alpha"), "", c.properties);
        ASSERT_EQ(response.instances.size(), c.operation == associators ? 3U : 4U) << response.message.value_or("");
        for (const Instance &answer : response.instances) {
            std::vector<std::string> names;
            for (const NamedValue &property : answer.properties) names.push_back(property.name);
            EXPECT_THAT(names, testing::UnorderedElementsAreArray(c.kept)) << formatPath(answer.path);
            // The provider reuses one instance for all its answers: each
            // answer must still be the one it was when returned.
            if (const CimValue *note = answer.property("Note")) {
                EXPECT_EQ(note->text, answer.path.key("Dependent")->reference->keys.at(0).value.text);
            }
        }
    }
}

}  // namespace
