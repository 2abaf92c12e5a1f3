// Every class the registrations serve, compared through the embedded broker
// as a client of sfcb would: instance names against the paths and keys of
// the instances, each name's instance against the enumerated one, every
// property's type against its class, and for every association the names
// against the instances from an instance at each of its ends. Only the
// differences listed in `expectedExceptions` are accepted, and each of those
// must show exactly as described.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <chrono>
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
const std::vector<std::string> kProviderDirs = {TVX_SUITE_PROVIDER_DIRS};
const std::vector<std::string> kRegistrations = {TVX_SUITE_REGISTRATIONS};
const std::vector<std::string> kMofFiles = {TVX_SUITE_MOFS};

enum class Deviation {
    ProviderUnavailable,  // every request for the class fails with CMPI_RC_ERR_FAILED
    NoGetInstance,        // getInstance answers CMPI_RC_ERR_NOT_SUPPORTED
    PropertyType,         // `property` has type `type`, not the one its class declares
    SharedNames,          // several instances share one name; getInstance answers the first
};

struct ExpectedException {
    const char *className;
    Deviation deviation;
    const char *reason;
    const char *property = nullptr;
    CMPIType type = CMPI_null;
};

const ExpectedException expectedExceptions[] = {
    {"Test_Missing", Deviation::ProviderUnavailable, "its provider library does not exist"},
    {"Test_NoFactory", Deviation::ProviderUnavailable, "its provider has no factory in the library"},
    {"Test_NullFactory", Deviation::ProviderUnavailable, "its provider's factory returns no interface"},
    {"Test_ThrowingFactory", Deviation::ProviderUnavailable, "its provider's constructor throws"},
    {"Test_WidgetGadget", Deviation::NoGetInstance, "the links are served by enumeration and traversal only"},
    {"Talvex_EthernetPort", Deviation::PropertyType,
     "AutoSense is a uint16 (1 or 0) where the DMTF class declares a boolean", "AutoSense", CMPI_uint16},
    {"Talvex_KernelIPv6ProtocolEndpoint", Deviation::SharedNames,
     "every IPv6 address of an interface is named by the interface alone"},
};

const ExpectedException *expected(const std::string &className, Deviation deviation) {
    for (const ExpectedException &exception : expectedExceptions) {
        if (exception.deviation == deviation && equalsIgnoreCase(exception.className, className)) return &exception;
    }
    return nullptr;
}

BrokerConfig suiteConfig() { return loadBrokerConfig(kProviderDirs, kRegistrations, kMofFiles); }

// Read while the tests are being listed; a registration that cannot be read
// gives no classes, and RegistrationsServeInstances says why.
std::vector<std::string> servedClasses(bool ProviderRegistration::*kind) {
    std::vector<std::string> classes;
    std::set<std::string> seen;
    try {
        for (const std::string &file : kRegistrations) {
            for (const ProviderRegistration &registration : readRegistrationFile(file)) {
                if (registration.*kind && seen.insert(toLowerAscii(registration.className)).second) {
                    classes.push_back(registration.className);
                }
            }
        }
    } catch (const std::exception &) {
        classes.clear();
    }
    return classes;
}

TEST(ConsistencySuite, RegistrationsServeInstances) {
    ASSERT_NO_THROW(suiteConfig());
    EXPECT_FALSE(servedClasses(&ProviderRegistration::instance).empty()) << kRegistrations.front();
}

class ServedClass : public testing::TestWithParam<std::string> {
protected:
    // As a client of a broker that has served a while: every instance
    // provider loaded and its threads past their first cycle, so that
    // requests in a row see the same objects.
    void SetUp() override { ASSERT_TRUE(loadInstanceProviders(broker, std::chrono::seconds(30))); }

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

    // Each property has the type its class declares, unless listed.
    void checkPropertyTypes(const Instance &instance) const {
        for (const NamedValue &property : instance.properties) {
            const PropertyDecl *declared = broker.schema().findProperty(instance.path.className, property.name);
            ASSERT_NE(declared, nullptr) << instance.path.className << " declares no " << property.name;
            const ExpectedException *exception = expected(instance.path.className, Deviation::PropertyType);
            if (exception != nullptr && equalsIgnoreCase(exception->property, property.name)) {
                EXPECT_EQ(property.value.type, exception->type) << exception->reason;
                continue;
            }
            EXPECT_EQ(property.value.type, declared->type) << instance.path.className << "." << property.name;
        }
    }

    // The names one request gave are those of the instances its twin gave,
    // and each instance's path is the name its keys make.
    void checkNamesOfInstances(const Response &names, const Response &instances) const {
        ASSERT_TRUE(names.ok()) << describeFailure(names);
        ASSERT_TRUE(instances.ok()) << describeFailure(instances);
        std::vector<std::string> named, enumerated;
        for (const ObjectPath &path : names.paths) named.push_back(text(path));
        for (const Instance &instance : instances.instances) {
            enumerated.push_back(text(nameOf(instance, broker.schema())));
            EXPECT_EQ(text(instance.path), enumerated.back());
            checkPropertyTypes(instance);
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
    bool shared = false;
    for (const Instance &instance : instances.instances) {
        shared = !enumerated.emplace(text(nameOf(instance, broker.schema())), &instance).second || shared;
    }
    const ExpectedException *sharedNames = expected(GetParam(), Deviation::SharedNames);
    EXPECT_EQ(shared, sharedNames != nullptr) << (sharedNames ? sharedNames->reason : "instances share a name");
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
        ServedClass::SetUp();
        if (const ExpectedException *unavailable = expected(GetParam(), Deviation::ProviderUnavailable)) {
            GTEST_SKIP() << unavailable->reason;
        }
        starts = associationStarts(broker, GetParam(), classPath(GetParam()).nameSpace);
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
        checkNamesOfInstances(names, broker.references(start, GetParam(), "", std::nullopt));
    }
}

// A registration may serve no association at all.
GTEST_ALLOW_UNINSTANTIATED_PARAMETERIZED_TEST(ServedAssociation);
INSTANTIATE_TEST_SUITE_P(Registered, ServedAssociation,
                         testing::ValuesIn(servedClasses(&ProviderRegistration::association)),
                         [](const auto &test) { return test.param; });

}  // namespace
