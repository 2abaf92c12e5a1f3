// Talvex_Processor through the embedded broker and the shipped library: the
// paths and their order, the values clients read (arrays that keep their
// holes, the brand text), how getInstance reads DeviceID, and the answers
// for another class and for a failing inventory.
#include <unistd.h>

#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "core/Broker.h"
#include "hostsim/HostSimControl.h"

namespace {

using namespace tvxbroker;

constexpr const char *kNs = "root/cimv2";
constexpr const char *kClass = "Talvex_Processor";
constexpr const char *kUnserved = "Test_UnservedProcessor";

// cpu-0: long mode and no-execute only, brand 0; cpu-1: AMD with every
// feature, brand 0x1f.
std::string twoPackageHost(const std::string &policy, bool threads, const std::string &faults = "") {
    return R"({"hostType": "Corlai", "faults": [)" + faults + R"(], "processors": {
        "hardwareThreads": )" + (threads ? "true" : "false") + R"(, "powerPolicy": ")" + policy + R"(",
        "modelText": "Model   ", "packages": [
        {"cpuid": {"vendor": "GenuineIntel", "stepping": 3, "extendedEdx": "0x20100000"},
         "cores": [{}, {}]},
        {"cpuid": {"vendor": "AuthenticAMD", "stepping": 12, "leaf1Ebx": "0x1f",
                   "extendedEcx": "0x4", "extendedEdx": "0x20100000"},
         "cores": [{"state": 1}]}]}})";
}

class ProcessorProvider : public testing::Test {
protected:
    void SetUp() override {
        BrokerConfig config =
            loadBrokerConfig({TVX_PROVIDER_DIR}, TVX_PROVIDER_REG, {TVX_PRODUCT_MOFS, TVX_TEST_MOF});
        for (const ProviderRegistration &registration : std::vector<ProviderRegistration>(config.registrations)) {
            if (registration.className != kClass) continue;
            ProviderRegistration unserved = registration;
            unserved.className = kUnserved;
            config.registrations.push_back(unserved);
        }
        broker = std::make_unique<Broker>(std::move(config));
    }

    void TearDown() override {
        EXPECT_EQ(broker->liveObjectCount(), 0u);
        broker->shutdown();
        EXPECT_EQ(HostSim_LiveListCount(), 0u) << "a system-information list was not freed";
        HostSim_ResetProfile();
    }

    static void serve(const std::string &profile) {
        char error[256];
        ASSERT_EQ(HostSim_LoadProfileText(profile.c_str(), error, sizeof error), 0) << error;
    }

    static ObjectPath path(const std::string &cls, const std::string &deviceId) {
        return ObjectPath{"", kNs, cls, {{"DeviceID", CimValue::makeString(deviceId)}}};
    }

    std::vector<Instance> enumerate() const {
        const Response response = broker->enumInstances(ObjectPath{"", kNs, kClass, {}}, {});
        EXPECT_TRUE(response.ok()) << response.rc;
        return response.instances;
    }

    std::unique_ptr<Broker> broker;
};

// Array elements as text, "null" for a hole.
std::vector<std::string> elements(const Instance &instance, const char *property) {
    std::vector<std::string> shown;
    const CimValue *value = instance.property(property);
    if (value == nullptr) return {"absent"};
    for (const CimValue &element : value->elements) {
        if (element.null) {
            shown.push_back("null");
        } else if (element.type == CMPI_string) {
            shown.push_back(element.text);
        } else {
            shown.push_back(std::to_string(element.unsignedValue));
        }
    }
    return shown;
}

using Texts = std::vector<std::string>;

TEST_F(ProcessorProvider, PathsCarryTheFiveKeysInPackageOrder) {
    serve(twoPackageHost("static", false));
    const Response names = broker->enumInstanceNames(ObjectPath{"", kNs, kClass, {}});
    ASSERT_TRUE(names.ok());
    ASSERT_EQ(names.paths.size(), 2u);
    char host[256] = {};
    ::gethostname(host, sizeof host - 1);
    const char *expectedKeys[] = {"SystemCreationClassName", "SystemName", "CreationClassName",
                                  "DeviceID", "ElementName"};
    for (std::size_t i = 0; i < 2; ++i) {
        const ObjectPath &name = names.paths[i];
        ASSERT_EQ(name.keys.size(), 5u);
        for (std::size_t k = 0; k < 5; ++k) EXPECT_EQ(name.keys[k].name, expectedKeys[k]);
        EXPECT_EQ(name.key("SystemName")->text, host);
        EXPECT_EQ(name.key("CreationClassName")->text, kClass);
        EXPECT_EQ(name.key("DeviceID")->text, "cpu-" + std::to_string(i));
        EXPECT_EQ(name.key("ElementName")->text, "cpu-" + std::to_string(i));
    }
}

TEST_F(ProcessorProvider, CharacteristicsKeepFiveElementsWithHolesForAbsentFeatures) {
    const struct {
        const char *policy;
        bool threads;
        Texts intel, intelEnabled, amd, amdEnabled;
    } cases[] = {
        {"off", false,
         {"2", "null", "null", "6", "null"}, {"2", "null", "null", "2", "null"},
         {"2", "4", "null", "6", "null"}, {"2", "2", "null", "2", "null"}},
        {"static", true,
         {"2", "null", "5", "6", "7"}, {"2", "null", "2", "2", "3"},
         {"2", "4", "5", "6", "7"}, {"2", "2", "2", "2", "3"}},
        {"dynamic", false,
         {"2", "null", "null", "6", "7"}, {"2", "null", "null", "2", "2"},
         {"2", "4", "null", "6", "7"}, {"2", "2", "null", "2", "2"}},
    };
    for (const auto &c : cases) {
        serve(twoPackageHost(c.policy, c.threads));
        const std::vector<Instance> instances = enumerate();
        ASSERT_EQ(instances.size(), 2u);
        EXPECT_EQ(elements(instances[0], "Characteristics"), c.intel) << c.policy;
        EXPECT_EQ(elements(instances[0], "EnabledProcessorCharacteristics"), c.intelEnabled) << c.policy;
        EXPECT_EQ(elements(instances[1], "Characteristics"), c.amd) << c.policy;
        EXPECT_EQ(elements(instances[1], "EnabledProcessorCharacteristics"), c.amdEnabled) << c.policy;
    }
}

TEST_F(ProcessorProvider, ScalarsAndTheBrandTextAsClientsReadThem) {
    serve(twoPackageHost("static", false));
    const std::vector<Instance> instances = enumerate();
    ASSERT_EQ(instances.size(), 2u);
    const Instance &intel = instances[0];
    const Instance &amd = instances[1];
    EXPECT_EQ(elements(intel, "OtherIdentifyingInfo"), Texts{"0x   0"});
    EXPECT_EQ(elements(amd, "OtherIdentifyingInfo"), Texts{"0x  1f"});
    EXPECT_EQ(elements(amd, "IdentifyingDescriptions"), Texts{"Brand ID"});
    EXPECT_EQ(elements(amd, "OperationalStatus"), Texts{"2"});
    EXPECT_EQ(intel.property("Vendor")->unsignedValue, 2u);
    EXPECT_EQ(amd.property("Vendor")->unsignedValue, 3u);
    EXPECT_EQ(intel.property("Vendor")->type, CMPI_uint16);
    EXPECT_EQ(intel.property("NumberOfEnabledCores")->unsignedValue, 2u);
    EXPECT_EQ(intel.property("CPUStatus")->unsignedValue, 4u);
    EXPECT_EQ(amd.property("CPUStatus")->unsignedValue, 1u);
    EXPECT_EQ(amd.property("Stepping")->text, "12");
    EXPECT_EQ(amd.property("ModelName")->text, "Model   ");
}

TEST_F(ProcessorProvider, GetInstanceReadsTheNumberAfterTheLastHyphen) {
    serve(twoPackageHost("static", false));
    const struct {
        const char *cls;
        const char *deviceId;
        CMPIrc rc;
        const char *found;  // DeviceID of the answer; null: none
    } cases[] = {
        {kClass, "cpu-1", CMPI_RC_OK, "cpu-1"},
        {kClass, "package-1", CMPI_RC_OK, "cpu-1"},
        {kClass, "cpu-01", CMPI_RC_OK, "cpu-1"},
        {kClass, "a-b-0", CMPI_RC_OK, "cpu-0"},
        {kClass, "cpu- 1x", CMPI_RC_OK, "cpu-1"},
        {"talvex_processor", "cpu-0", CMPI_RC_OK, "cpu-0"},
        {kClass, "cpu-7", CMPI_RC_ERR_NOT_FOUND, nullptr},
        {kClass, "cpu-2", CMPI_RC_ERR_NOT_FOUND, nullptr},
        {kClass, "cpu--1", CMPI_RC_OK, "cpu-1"},
        {kClass, "cpu-99999999999999999999", CMPI_RC_ERR_NOT_FOUND, nullptr},
        {kClass, "cpu", CMPI_RC_ERR_NOT_FOUND, nullptr},
        {kClass, "", CMPI_RC_ERR_NOT_FOUND, nullptr},
        {kUnserved, "cpu-0", CMPI_RC_OK, nullptr},
    };
    for (const auto &c : cases) {
        const Response response = broker->getInstance(path(c.cls, c.deviceId), {});
        EXPECT_EQ(response.rc, c.rc) << c.cls << " " << c.deviceId;
        ASSERT_EQ(response.instances.size(), c.found ? 1u : 0u) << c.cls << " " << c.deviceId;
        if (c.found) {
            EXPECT_EQ(response.instances[0].property("DeviceID")->text, c.found);
        }
    }
}

TEST_F(ProcessorProvider, AFailingInventoryIsAnEmptyEnumerationAndNotFound) {
    for (const char *fault : {R"({"call": "PRB_CheckSig"})", R"({"call": "PRB_Get", "node": 607})"}) {
        serve(twoPackageHost("static", false, fault));
        EXPECT_TRUE(enumerate().empty()) << fault;
        const Response names = broker->enumInstanceNames(ObjectPath{"", kNs, kClass, {}});
        EXPECT_TRUE(names.ok());
        EXPECT_TRUE(names.paths.empty());
        EXPECT_EQ(broker->getInstance(path(kClass, "cpu-0"), {}).rc, CMPI_RC_ERR_NOT_FOUND) << fault;
    }
    serve(twoPackageHost("static", false));
    const Response other = broker->enumInstances(ObjectPath{"", kNs, kUnserved, {}}, {});
    EXPECT_TRUE(other.ok());
    EXPECT_TRUE(other.instances.empty());
}

}  // namespace
