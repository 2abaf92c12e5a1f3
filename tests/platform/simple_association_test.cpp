// The four association operations of OMC::SimpleAssociationMI, through the
// embedded broker, on a provider whose doReferences ignores every filter
// and rebuilds every reference without a namespace (assocprovider/).
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <string>
#include <vector>

#include "core/Broker.h"
#include "model/PathText.h"

namespace {

using namespace tvxbroker;

ObjectPath object(const char *className, const std::string &name, const char *ns = "root/cimv2") {
    const char *key = std::string(className) == "Test_System" ? "Name" : "DeviceID";
    return ObjectPath{"", ns, className, {{key, CimValue::makeString(name)}}};
}

ObjectPath system(const std::string &name) { return object("Test_System", name); }

// A reference name: the association keyed by its references as the provider set them.
ObjectPath link(const char *assocClass, const std::string &system, const char *deviceClass, const char *device) {
    return ObjectPath{"", "root/cimv2", assocClass,
                      {{"Antecedent", CimValue::makeReference(object("Test_System", system, ""))},
                       {"Dependent", CimValue::makeReference(object(deviceClass, device, ""))}}};
}

// Sorted, since the order of the answers is the provider's.
std::vector<std::string> texts(const std::vector<ObjectPath> &paths, const std::vector<Instance> &instances = {}) {
    std::vector<std::string> result;
    for (const ObjectPath &path : paths) result.push_back(formatPath(path));
    for (const Instance &instance : instances) result.push_back(formatPath(instance.path));
    std::sort(result.begin(), result.end());
    return result;
}

enum Operation { associators, associatorNames, references, referenceNames };

// The association class, result class, role and result role of a request;
// the reference operations take the first and the third only.
using Filters = std::array<const char *, 4>;

class SimpleAssociation : public testing::Test {
protected:
    Response request(Operation operation, const ObjectPath &source, const Filters &f,
                     const PropertyList &properties = std::nullopt) {
        if (operation == associators) return broker.associators(source, f[0], f[1], f[2], f[3], properties);
        if (operation == associatorNames) return broker.associatorNames(source, f[0], f[1], f[2], f[3]);
        if (operation == references) return broker.references(source, f[0], f[2], properties);
        return broker.referenceNames(source, f[0], f[2]);
    }

    Broker broker{loadBrokerConfig({TVX_OMCTESTPROVIDER_DIR}, {TVX_OMCTESTPROVIDER_REG}, {TVX_OMCTESTPROVIDER_MOF})};
};

TEST_F(SimpleAssociation, EachOperationAnswersWhatItsFiltersLetThrough) {
    const ObjectPath alpha = system("alpha");
    const ObjectPath disk0 = object("Test_Disk", "disk0");
    const ObjectPath disk1 = object("Test_Disk", "disk1");
    const ObjectPath ghost = object("Test_Disk", "ghost");  // linked to, but not served
    const std::vector<ObjectPath> fromAlpha = {disk0, object("Test_Device", "nic0"), ghost, disk1};
    const std::vector<ObjectPath> ofAlpha = {link("Test_HostedDevice", "alpha", "Test_Disk", "disk0"),
                                             link("Test_HostedDevice", "alpha", "Test_Device", "nic0"),
                                             link("Test_HostedDevice", "alpha", "Test_Disk", "ghost"),
                                             link("Test_SpareDevice", "alpha", "Test_Disk", "disk1")};
    const std::vector<Operation> referencing = {references, referenceNames};
    // The provider links this device to a system named after the filters it was given.
    const ObjectPath echo = object("Test_Device", "echo");
    const Filters echoed = {"Test_HostedDevice", "Test_System", "Dependent", "Antecedent"};
    struct Case {
        std::vector<Operation> operations;
        ObjectPath source;
        Filters filters;
        std::vector<ObjectPath> answers;
    };
    // The provider ignores every filter; the base applies them, the product's
    // providers only narrowing further.
    const Case cases[] = {
        {{associatorNames}, alpha, {"", "", "", ""}, fromAlpha},
        {{associatorNames}, alpha, {"Test_SpareDevice", "", "", ""}, {disk1}},
        {{associators}, alpha, {"", "Test_Disk", "", ""}, {disk0, disk1}},
        {{associatorNames}, alpha, {"", "", "antecedent", "DEPENDENT"}, fromAlpha},
        {{associatorNames}, alpha, {"", "", "Dependent", ""}, {}},
        {{associatorNames}, disk0, {"", "", "Dependent", "Antecedent"}, {alpha, system("beta")}},
        {referencing, alpha, {"Test_SystemDevice", "", "ANTECEDENT", ""}, ofAlpha},
        {{associatorNames}, echo, echoed, {system("Test_HostedDevice Test_System Dependent Antecedent")}},
        // Only far ends that exist are fetched, whether the source exists or not.
        {{associators}, ghost, {"", "", "", ""}, {alpha}},
        // The reference operations pass their result class as the association class.
        {referencing, echo, echoed,
         {link("Test_HostedDevice", "Test_HostedDevice (null) Dependent (null)", "Test_Device", "echo")}},
    };
    for (const Case &c : cases) {
        for (const Operation operation : c.operations) {
            const Filters &f = c.filters;
            SCOPED_TRACE(testing::Message() << "operation " << operation << " from " << formatPath(c.source) << ": "
                                            << f[0] << "|" << f[1] << "|" << f[2] << "|" << f[3]);
            const Response response = request(operation, c.source, f);
            ASSERT_TRUE(response.ok()) << response.message.value_or("");
            EXPECT_TRUE(response.done);
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
        {associators, std::nullopt, {"DeviceID", "Model", "Size"}},
        {associators, PropertyList{{"Size"}}, {"DeviceID", "Size"}},
        {references, std::nullopt, association},
        {references, PropertyList{std::vector<std::string>{}}, {"Antecedent", "Dependent"}},
    };
    for (const auto &c : cases) {
        const Response response = request(c.operation, system("alpha"), {"", "", "", ""}, c.properties);
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

TEST_F(SimpleAssociation, EveryOperationAnswersNothingForALonelySourceAndOnlyTheStatusOnFailure) {
    const struct {
        const char *system;
        CMPIrc rc;
        const char *message;
    } sources[] = {
        {"lonely", CMPI_RC_OK, ""},
        {"broken", CMPI_RC_ERR_FAILED, "broken system"},
        {"confused", CMPI_RC_ERR_FAILED, "doReferences returned something other than an association instance"},
    };
    for (const Operation operation : {associators, associatorNames, references, referenceNames}) {
        for (const auto &source : sources) {
            const Response response = request(operation, system(source.system), {"", "", "", ""});
            EXPECT_EQ(response.rc, source.rc) << source.system;
            EXPECT_EQ(response.message.value_or(""), source.message);
            EXPECT_EQ(response.done, source.rc == CMPI_RC_OK) << source.system;
            EXPECT_TRUE(response.instances.empty() && response.paths.empty()) << source.system;
        }
    }
}

}  // namespace
