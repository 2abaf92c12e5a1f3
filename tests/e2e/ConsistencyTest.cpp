// Every class the registration serves, compared through the embedded broker
// as a client would: instance names against the keys of the instances, each
// name's instance against the enumerated one, and for every association the
// names against the instances from an instance at each of its ends. Only the
// differences listed in `expectedExceptions` are accepted, and each of those
// must show exactly as described.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdlib>
#include <map>
#include <set>

#include "ClientView.h"
#include "model/MofInstanceText.h"
#include "model/PathText.h"
#include "tvxcim/StatusText.h"

namespace {

using namespace consistency;
using namespace tvxbroker;
using testing::UnorderedElementsAreArray;
using tvxcim::describeFailure;

// What the suite runs on, fixed when it is built (tvx_add_consistency_suite).
const char *const kProviderDir = TVX_SUITE_PROVIDER_DIR;
const char *const kRegistration = TVX_SUITE_REGISTRATION;
const std::vector<std::string> kMofFiles = {TVX_SUITE_MOFS};
const std::vector<std::string> kEnvironment = {TVX_SUITE_ENVIRONMENT};  // NAME=value

enum class Deviation {
    ProviderUnavailable,        // every request for the class fails with CMPI_RC_ERR_FAILED
    NoGetInstance,              // getInstance answers CMPI_RC_ERR_NOT_SUPPORTED
    InstancePathWithFewerKeys,  // an instance's own path holds only some of its keys, maybe none
    PathWithExtraKey,           // names and own paths add `extraKey`, holding the property of that name
};

struct ExpectedException {
    const char *className;
    Deviation deviation;
    const char *reason;
    const char *extraKey = nullptr;
};

const ExpectedException expectedExceptions[] = {
    {"Test_Missing", Deviation::ProviderUnavailable, "its provider library does not exist"},
    {"Test_NoFactory", Deviation::ProviderUnavailable, "its provider has no factory in the library"},
    {"Test_NullFactory", Deviation::ProviderUnavailable, "its provider's factory returns no interface"},
    {"Test_ThrowingFactory", Deviation::ProviderUnavailable, "its provider's constructor throws"},
    {"Test_WidgetGadget", Deviation::NoGetInstance, "the links are served by enumeration and traversal only"},
    {"Test_EventCounter", Deviation::NoGetInstance, "the counter is served by enumeration only"},
    {"Test_ProviderStats", Deviation::NoGetInstance, "the statistics are served by enumeration only"},
    {"Talvex_EthernetPort", Deviation::InstancePathWithFewerKeys,
     "a port instance's own path carries DeviceID alone"},
    {"Talvex_EPDriverElementSoftwareIdentity", Deviation::InstancePathWithFewerKeys,
     "an association instance's own path carries no keys"},
    {"Talvex_EPFirmwareElementSoftwareIdentity", Deviation::InstancePathWithFewerKeys,
     "an association instance's own path carries no keys"},
    {"Talvex_Processor", Deviation::PathWithExtraKey,
     "a processor's path names its ElementName beside the four device keys", "ElementName"},
};

const ExpectedException *expected(const std::string &className, Deviation deviation) {
    for (const ExpectedException &exception : expectedExceptions) {
        if (exception.deviation == deviation && equalsIgnoreCase(exception.className, className)) return &exception;
    }
    return nullptr;
}

BrokerConfig suiteConfig() { return loadBrokerConfig({kProviderDir}, kRegistration, kMofFiles); }

// Read while the tests are being listed; a registration that cannot be read
// gives no classes, and RegistrationServesInstances says why.
std::vector<std::string> servedClasses(bool ProviderRegistration::*kind) {
    std::vector<std::string> classes;
    std::set<std::string> seen;
    try {
        for (const ProviderRegistration &registration : readRegistrationFile(kRegistration)) {
            if (registration.*kind && seen.insert(toLowerAscii(registration.className)).second) {
                classes.push_back(registration.className);
            }
        }
    } catch (const std::exception &) {
        classes.clear();
    }
    return classes;
}

// Before any provider is loaded, as under ctest so when run by hand.
class SuiteVariables : public testing::Environment {
public:
    void SetUp() override {
        for (const std::string &variable : kEnvironment) {
            const std::size_t equals = variable.find('=');
            ASSERT_EQ(setenv(variable.substr(0, equals).c_str(), variable.substr(equals + 1).c_str(), 1), 0)
                << variable;
        }
    }
};

testing::Environment *const suiteVariables = testing::AddGlobalTestEnvironment(new SuiteVariables);

TEST(ConsistencySuite, RegistrationServesInstances) {
    ASSERT_NO_THROW(suiteConfig());
    EXPECT_FALSE(servedClasses(&ProviderRegistration::instance).empty()) << kRegistration;
}

class ServedClass : public testing::TestWithParam<std::string> {
protected:
    // In the first namespace the registration serves the class under test
    // in; the classes at an association's ends are looked for there too.
    ObjectPath classPath(const std::string &className) const {
        for (const ProviderRegistration &registration : broker.registrations()) {
            if (equalsIgnoreCase(registration.className, GetParam())) {
                return ObjectPath{"", registration.namespaces.front(), className, {}};
            }
        }
        ADD_FAILURE() << GetParam() << " is not registered";
        return ObjectPath{"", "", className, {}};
    }

    std::string text(const ObjectPath &path) const { return canonicalText(path, broker.schema()); }

    // The name a client builds from the instance's keys, with the extra key
    // where one is expected.
    ObjectPath expectedName(const Instance &instance) const {
        ObjectPath name = nameOf(instance, broker.schema());
        if (const ExpectedException *extra = expected(instance.path.className, Deviation::PathWithExtraKey)) {
            const CimValue *value = instance.property(extra->extraKey);
            EXPECT_NE(value, nullptr) << extra->reason;
            if (value != nullptr) name.keys.push_back({extra->extraKey, *value});
        }
        return name;
    }

    // The instance's own path is its name, but where an exception is listed
    // and may apply: a reference must name its association in full.
    void checkOwnPath(const Instance &instance, bool exceptionsApply) const {
        ObjectPath name = expectedName(instance);
        const ExpectedException *fewerKeys =
            exceptionsApply ? expected(instance.path.className, Deviation::InstancePathWithFewerKeys) : nullptr;
        if (fewerKeys != nullptr) {
            EXPECT_LT(instance.path.keys.size(), name.keys.size()) << fewerKeys->reason;
            std::vector<NamedValue> carried;
            for (const NamedValue &key : instance.path.keys) {
                if (const CimValue *value = name.key(key.name)) carried.push_back({key.name, *value});
            }
            name.keys = carried;
        }
        EXPECT_EQ(text(instance.path), text(name)) << (fewerKeys != nullptr ? fewerKeys->reason : "");
    }

    // The names one request gave are those of the instances its twin gave.
    void checkNamesOfInstances(const Response &names, const Response &instances,
                               bool exceptionsApply = true) const {
        ASSERT_TRUE(names.ok()) << describeFailure(names);
        ASSERT_TRUE(instances.ok()) << describeFailure(instances);
        std::vector<std::string> named;
        std::vector<std::string> enumerated;
        for (const ObjectPath &path : names.paths) named.push_back(text(path));
        for (const Instance &instance : instances.instances) {
            enumerated.push_back(text(expectedName(instance)));
            checkOwnPath(instance, exceptionsApply);
        }
        EXPECT_THAT(named, UnorderedElementsAreArray(enumerated));
    }

    Broker broker{suiteConfig()};
};

TEST_P(ServedClass, NamesAreTheKeysOfTheInstancesAndEachGetsItsInstance) {
    const Response names = broker.enumInstanceNames(classPath(GetParam()));
    const Response instances = broker.enumInstances(classPath(GetParam()), std::nullopt);
    if (const ExpectedException *unavailable = expected(GetParam(), Deviation::ProviderUnavailable)) {
        EXPECT_EQ(names.rc, CMPI_RC_ERR_FAILED) << unavailable->reason;
        EXPECT_EQ(instances.rc, CMPI_RC_ERR_FAILED) << unavailable->reason;
        return;
    }
    checkNamesOfInstances(names, instances);
    if (HasFatalFailure()) return;
    std::map<std::string, const Instance *> enumerated;
    for (const Instance &instance : instances.instances) enumerated[text(expectedName(instance))] = &instance;
    const ExpectedException *noGet = expected(GetParam(), Deviation::NoGetInstance);
    for (const ObjectPath &name : names.paths) {
        const Response got = broker.getInstance(name, std::nullopt);
        if (noGet != nullptr) {
            EXPECT_EQ(got.rc, CMPI_RC_ERR_NOT_SUPPORTED) << text(name) << ": " << noGet->reason;
            continue;
        }
        ASSERT_TRUE(got.ok()) << text(name) << ": " << describeFailure(got);
        ASSERT_EQ(got.instances.size(), 1U) << text(name);
        const auto found = enumerated.find(text(name));
        ASSERT_NE(found, enumerated.end()) << text(name) << " has no enumerated instance";
        EXPECT_EQ(got.instances.front(), *found->second)
            << "got:\n" << formatInstanceMof(got.instances.front())
            << "enumerated:\n" << formatInstanceMof(*found->second);
    }
}

INSTANTIATE_TEST_SUITE_P(Registered, ServedClass, testing::ValuesIn(servedClasses(&ProviderRegistration::instance)),
                         [](const auto &test) { return test.param; });

// Each association is walked from the first instance at each of its ends
// that takes part in one.
class ServedAssociation : public ServedClass {
protected:
    void SetUp() override {
        if (const ExpectedException *unavailable = expected(GetParam(), Deviation::ProviderUnavailable)) {
            GTEST_SKIP() << unavailable->reason;
        }
        for (const PropertyDecl &role : rolesOf(GetParam(), broker.schema())) {
            const Response names = broker.enumInstanceNames(classPath(role.referenceClass));
            ASSERT_TRUE(names.ok()) << role.referenceClass << ": " << describeFailure(names);
            for (const ObjectPath &name : names.paths) {
                const Response associated = broker.associatorNames(name, GetParam(), "", "", "");
                if (associated.ok() && !associated.paths.empty()) {
                    starts.push_back(name);
                    break;
                }
            }
        }
        if (starts.empty()) GTEST_SKIP() << "no instance at either end takes part in " << GetParam();
    }

    std::vector<ObjectPath> starts;
};

TEST_P(ServedAssociation, AssociatorAndReferenceNamesAreTheKeysOfTheirInstances) {
    for (const ObjectPath &start : starts) {
        SCOPED_TRACE(formatPath(start));
        checkNamesOfInstances(broker.associatorNames(start, GetParam(), "", "", ""),
                              broker.associators(start, GetParam(), "", "", "", std::nullopt));
        const Response names = broker.referenceNames(start, GetParam(), "");
        EXPECT_FALSE(names.paths.empty()) << "an instance that has associators has references too";
        checkNamesOfInstances(names, broker.references(start, GetParam(), "", std::nullopt), false);
    }
}

// A registration may serve no association at all.
GTEST_ALLOW_UNINSTANTIATED_PARAMETERIZED_TEST(ServedAssociation);
INSTANTIATE_TEST_SUITE_P(Registered, ServedAssociation,
                         testing::ValuesIn(servedClasses(&ProviderRegistration::association)),
                         [](const auto &test) { return test.param; });

}  // namespace
