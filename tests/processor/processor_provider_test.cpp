// Talvex_Processor through the embedded broker and the shipped library: the
// values clients read in package order (arrays that keep their holes, the
// brand text), how getInstance reads DeviceID, and the answer for another
// class.
#include "ProductBroker.h"

namespace {

using namespace producttest;

constexpr const char *kClass = "Talvex_Processor";
constexpr const char *kUnserved = "Test_UnservedProcessor";

// cpu-0: long mode and no-execute only (the SVM bit is not Intel's), brand
// 0; cpu-1: AMD with every feature, brand 0x1f. The model text has a
// two-byte character, control characters and more than its field holds.
std::string twoPackageHost(const std::string &policy, bool threads) {
    return std::string(R"({"hostType": "Corlai", "processors": {
        "hardwareThreads": )") + (threads ? "true" : "false") + R"(, "powerPolicy": ")" + policy + R"(",
        "modelText": "Mod\u00e9l\t\u007fxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxx", "packages": [
        {"cpuid": {"vendor": "GenuineIntel", "stepping": 3, "extendedEcx": "0x4", "extendedEdx": "0x20100000"},
         "cores": [{}, {}]},
        {"cpuid": {"vendor": "AuthenticAMD", "stepping": 12, "leaf1Ebx": "0x1f",
                   "extendedEcx": "0x4", "extendedEdx": "0x20100000"},
         "cores": [{"state": 1}]}]}})";
}

class ProcessorProvider : public ProductBroker {
protected:
    ProcessorProvider() : ProductBroker(kClass, kUnserved) {}
};

// Characteristics keep five elements with holes for absent features; the
// brand index is padded as "0x%4x"; the model text keeps 47 bytes, each
// one that is not printable ASCII a space.
TEST_F(ProcessorProvider, ValuesAsClientsReadThem) {
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
    std::vector<std::map<std::string, std::string>> instances;
    for (const auto &c : cases) {
        serve(twoPackageHost(c.policy, c.threads));
        const Response response = broker->enumInstances(classPath(kClass), {});
        ASSERT_EQ(response.instances.size(), 2u) << response.rc;
        instances = {literals(response.instances[0]), literals(response.instances[1])};
        EXPECT_EQ(instances[0].at("Characteristics"), c.intel) << c.policy;
        EXPECT_EQ(instances[0].at("EnabledProcessorCharacteristics"), c.intelEnabled) << c.policy;
        EXPECT_EQ(instances[1].at("Characteristics"), c.amd) << c.policy;
        EXPECT_EQ(instances[1].at("EnabledProcessorCharacteristics"), c.amdEnabled) << c.policy;
    }
    EXPECT_EQ(instances[0].at("OtherIdentifyingInfo"), "{\"0x   0\"}");
    EXPECT_EQ(instances[1].at("OtherIdentifyingInfo"), "{\"0x  1f\"}");
    EXPECT_EQ(instances[1].at("Stepping"), "\"12\"");
    EXPECT_EQ(instances[1].at("ModelName"), "\"Mod  l  " + std::string(39, 'x') + "\"");
}

TEST_F(ProcessorProvider, GetInstanceReadsTheNumberAfterTheLastHyphen) {
    serve(twoPackageHost("static", false));
    const struct {
        const char *cls;
        const char *deviceId;
        const char *found;  // DeviceID of the answer; null: NOT_FOUND
    } cases[] = {
        {kClass, "a-b-0", "cpu-0"},
        {kClass, "cpu- 1x", "cpu-1"},
        {kClass, "cpu-2", nullptr},
        {kClass, "cpu-99999999999999999999", nullptr},
        {kUnserved, "cpu-0", nullptr},  // OK with nothing, as a client sees it
    };
    for (const auto &c : cases) {
        const ObjectPath path{"", kNs, c.cls, {{"DeviceID", CimValue::makeString(c.deviceId)}}};
        const Response response = broker->getInstance(path, {});
        EXPECT_EQ(response.rc, c.found ? CMPI_RC_OK : CMPI_RC_ERR_NOT_FOUND) << c.cls << " " << c.deviceId;
        ASSERT_EQ(response.instances.size(), c.found ? 1u : 0u) << c.cls << " " << c.deviceId;
        if (c.found) {
            EXPECT_EQ(response.instances[0].property("DeviceID")->text, c.found);
        }
    }
}

}  // namespace
