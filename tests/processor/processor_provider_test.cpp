// Talvex_Processor through the embedded broker and the shipped library: the
// values clients read in package order (arrays that keep their holes, the
// brand text), how getInstance reads DeviceID, and the answers for another
// class.
#include "ProductBroker.h"

namespace {

using namespace producttest;

constexpr const char *kClass = "Talvex_Processor";
constexpr const char *kUnserved = "Test_UnservedProcessor";

// cpu-0: long mode and no-execute only, brand 0; cpu-1: AMD with every
// feature, brand 0x1f.
std::string twoPackageHost(const std::string &policy, bool threads) {
    return std::string(R"({"hostType": "Corlai", "processors": {
        "hardwareThreads": )") + (threads ? "true" : "false") + R"(, "powerPolicy": ")" + policy + R"(",
        "modelText": "Model   ", "packages": [
        {"cpuid": {"vendor": "GenuineIntel", "stepping": 3, "extendedEdx": "0x20100000"},
         "cores": [{}, {}]},
        {"cpuid": {"vendor": "AuthenticAMD", "stepping": 12, "leaf1Ebx": "0x1f",
                   "extendedEcx": "0x4", "extendedEdx": "0x20100000"},
         "cores": [{"state": 1}]}]}})";
}

class ProcessorProvider : public ProductBroker {
protected:
    ProcessorProvider() : ProductBroker(kClass, kUnserved) {}

    // The MOF literals of each instance, in package order.
    std::vector<std::map<std::string, std::string>> enumerate() const {
        const Response response = broker->enumInstances(classPath(kClass), {});
        EXPECT_TRUE(response.ok()) << response.rc;
        std::vector<std::map<std::string, std::string>> shown;
        for (const Instance &instance : response.instances) shown.push_back(literals(instance));
        return shown;
    }
};

TEST_F(ProcessorProvider, CharacteristicsKeepFiveElementsWithHolesForAbsentFeatures) {
    const struct {
        const char *policy;
        bool threads;
        const char *intel, *intelEnabled, *amd, *amdEnabled;
    } cases[] = {
        {"off", false, "{2, NULL, NULL, 6, NULL}", "{2, NULL, NULL, 2, NULL}",
         "{2, 4, NULL, 6, NULL}", "{2, 2, NULL, 2, NULL}"},
        {"static", true, "{2, NULL, 5, 6, 7}", "{2, NULL, 2, 2, 3}", "{2, 4, 5, 6, 7}", "{2, 2, 2, 2, 3}"},
        {"dynamic", false, "{2, NULL, NULL, 6, 7}", "{2, NULL, NULL, 2, 2}",
         "{2, 4, NULL, 6, 7}", "{2, 2, NULL, 2, 2}"},
    };
    for (const auto &c : cases) {
        serve(twoPackageHost(c.policy, c.threads));
        const auto instances = enumerate();
        ASSERT_EQ(instances.size(), 2u);
        EXPECT_EQ(instances[0].at("Characteristics"), c.intel) << c.policy;
        EXPECT_EQ(instances[0].at("EnabledProcessorCharacteristics"), c.intelEnabled) << c.policy;
        EXPECT_EQ(instances[1].at("Characteristics"), c.amd) << c.policy;
        EXPECT_EQ(instances[1].at("EnabledProcessorCharacteristics"), c.amdEnabled) << c.policy;
    }
}

// The brand index padded as "0x%4x", and texts kept as the host gives them.
TEST_F(ProcessorProvider, TextsAsClientsReadThem) {
    serve(twoPackageHost("static", false));
    const auto instances = enumerate();
    ASSERT_EQ(instances.size(), 2u);
    EXPECT_EQ(instances[0].at("OtherIdentifyingInfo"), "{\"0x   0\"}");
    EXPECT_EQ(instances[1].at("OtherIdentifyingInfo"), "{\"0x  1f\"}");
    EXPECT_EQ(instances[1].at("Stepping"), "\"12\"");
    EXPECT_EQ(instances[1].at("ModelName"), "\"Model   \"");
}

TEST_F(ProcessorProvider, GetInstanceReadsTheNumberAfterTheLastHyphen) {
    serve(twoPackageHost("static", false));
    const struct {
        const char *cls;
        const char *deviceId;
        CMPIrc rc;
        const char *found;  // DeviceID of the answer; null: none
    } cases[] = {
        {kClass, "a-b-0", CMPI_RC_OK, "cpu-0"},
        {kClass, "cpu- 1x", CMPI_RC_OK, "cpu-1"},
        {"talvex_processor", "cpu-0", CMPI_RC_OK, "cpu-0"},
        {kClass, "cpu-2", CMPI_RC_ERR_NOT_FOUND, nullptr},
        {kClass, "cpu-99999999999999999999", CMPI_RC_ERR_NOT_FOUND, nullptr},
        {kUnserved, "cpu-0", CMPI_RC_ERR_NOT_FOUND, nullptr},  // OK with nothing, as a client sees it
    };
    for (const auto &c : cases) {
        const ObjectPath path{"", kNs, c.cls, {{"DeviceID", CimValue::makeString(c.deviceId)}}};
        const Response response = broker->getInstance(path, {});
        EXPECT_EQ(response.rc, c.rc) << c.cls << " " << c.deviceId;
        ASSERT_EQ(response.instances.size(), c.found ? 1u : 0u) << c.cls << " " << c.deviceId;
        if (c.found) {
            EXPECT_EQ(response.instances[0].property("DeviceID")->text, c.found);
        }
    }
}

TEST_F(ProcessorProvider, AnotherClassIsAnEmptyEnumeration) {
    serve(twoPackageHost("static", false));
    const Response other = broker->enumInstances(classPath(kUnserved), {});
    EXPECT_TRUE(other.ok());
    EXPECT_TRUE(other.instances.empty());
}

}  // namespace
