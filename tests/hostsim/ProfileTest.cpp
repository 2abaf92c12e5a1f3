#include <gmock/gmock.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>

#include "HostSimTesting.h"

namespace hostsim_test {
namespace {

using ::testing::StartsWith;

// A "Corlai" host with one section given as JSON text.
std::string with(const char *section, const std::string &json) {
    return std::string(R"({"hostType": "Corlai", ")") + section + "\": " + json + "}";
}
std::string withCores(const char *coresJson) {
    return with("processors", std::string(R"({"packages": [{}, {"cores": [)") + coresJson + "]}]}");
}

class HostSimProfiles : public HostSimTest {};

// One of each kind of refusal, and every bound that keeps a record or a list
// from growing past what the nodes serve.
TEST_F(HostSimProfiles, GarbledProfilesAreRefusedNamingTheField) {
    const std::pair<std::string, std::string> cases[] = {
        {"{", "not valid JSON: line 1, column 2: syntax error"},
        {"{}", "hostType: missing"},
        {R"({"hostType": "corla"})", R"(hostType: expected "Corla" or "Corlai", got "corla")"},
        {R"({"hostType": "Corla", "adaptres": []})", "adaptres: unknown field"},
        {R"({"hostType": "Corla", "adapters": {}})", "adapters: expected an array, got an object"},
        {with("adapters", R"([{"name": "a", "speedMbps": 70000}])"),
         "adapters[0].speedMbps: expected an integer from 0 to 65535 (or hexadecimal text such as \"0x1f\"), "
         "got 70000"},
        {with("adapters", R"([{"name": "a", "speedMbps": "0x1zz"}])"), "adapters[0].speedMbps: expected an integer"},
        {with("adapters", R"([{"name": "a", "count": 3}, {"name": "a1"}])"),
         R"(adapters[1].name: duplicate adapter name "a1")"},
        {with("faults", R"([{"call": "PRB_Nope"}])"),
         R"(faults[0].call: unknown call "PRB_Nope" (known: PRB_CheckSig,)"},
        {with("faults", R"([{"call": "PRB_CheckSig", "nth": 0}])"), "faults[0].nth: expected an integer from 1 to"},
        {with("processors", R"({"packages": [{"cpuid": {"vendor": "GenuineIntelX"}}]})"),
         "processors.packages[0].cpuid.vendor: expected a text of at most 12 bytes"},
        {withCores(R"({"state": 256})"), "processors.packages[1].cores[0].state: expected true, false or an integer"},
        {withCores(R"({"instance": 2147483648})"),
         "processors.packages[1].cores[0].instance: expected an integer from -2147483648 to 2147483647"},
        {withCores(R"({"count": 100000}, {})"), "processors: more than 100000 cores"},
        {with("ipInterfaces", R"([{"name": ")" + std::string(256, 'n') + R"("}])"),
         "ipInterfaces[0].name: expected a text of at most 255 bytes, got 256"},
        {with("ipInterfaces", R"([{"name": "vmk", "count": 11}, {"name": "vmk1", "count": 1}])"),
         R"(ipInterfaces[1].name: duplicate interface name "vmk10")"},
        {with("ipInterfaces", R"([{"name": "vmk10"}, {"name": "vmk", "count": 11}])"),
         R"(ipInterfaces[1].name: duplicate interface name "vmk10")"},
        {with("ipInterfaces", R"([{"name": "a", "ipv4Address": "300.1.2.3"}])"),
         R"(ipInterfaces[0].ipv4Address: expected a dotted-decimal IPv4 address such as "192.168.0.1", )"
         R"(got "300.1.2.3")"},
        {with("ipInterfaces", "[{\"name\": \"a\", \"ipv4Address\": \"1.2.3.4\\u0000\"}]"),
         "ipInterfaces[0].ipv4Address: expected a dotted-decimal IPv4 address"},
        {with("ipInterfaces", R"([{"name": "a", "ipv4Netmask": "255.0.0.0"}])"),
         "ipInterfaces[0].ipv4Netmask: given without ipv4Address"},
        {with("ipInterfaces", R"([{"name": "a", "ipv6": [{"address": "::1"}, {"instance": "0", "address": "::2"}]}])"),
         R"(ipInterfaces[0].ipv6[1].instance: duplicate IPv6 instance "0")"},
        {with("ipInterfaces", R"([{"name": "a", "count": 100000}, {"name": "b"}])"),
         "ipInterfaces: more than 100000 interfaces"},
    };
    serve(host({{{"name", "kept"}}}));
    for (const auto &[json, message] : cases) EXPECT_THAT(loadError(json), StartsWith(message)) << json;
    EXPECT_EQ(servedAdapterNames(), std::vector<std::string>{"kept"}) << "a refused profile replaces nothing";
}

TEST_F(HostSimProfiles, FilesAreServedOrRefusedWithTheirPath) {
    const std::string good = ::testing::TempDir() + "hostsim-good.json";
    const std::string garbled = ::testing::TempDir() + "hostsim-garbled.json";
    const std::string missing = ::testing::TempDir() + "hostsim-missing.json";
    std::ofstream(good) << host({{{"name", "from-file"}}});
    std::ofstream(garbled) << R"({"hostType": )";
    const std::pair<std::string, std::string> refusals[] = {
        {garbled, garbled + ": not valid JSON: line 1, column 14"},
        {missing, missing + ": No such file or directory"},
        {::testing::TempDir(), ::testing::TempDir() + ": not a regular file"},
    };
    char error[256];
    for (const auto &[path, message] : refusals) {  // loading reads files the same way
        EXPECT_NE(HostSim_CheckProfileFile(path.c_str(), error, sizeof error), 0);
        EXPECT_THAT(error, StartsWith(message));
    }
    EXPECT_EQ(HostSim_CheckProfileFile(good.c_str(), error, sizeof error), 0);
    EXPECT_NE(servedAdapterNames(), std::vector<std::string>{"from-file"}) << "checking serves nothing";
    EXPECT_EQ(HostSim_LoadProfileFile(good.c_str(), nullptr, 0), 0);
    EXPECT_EQ(servedAdapterNames(), std::vector<std::string>{"from-file"});
    for (const auto &example : std::filesystem::directory_iterator(HOSTSIM_PROFILE_DIR)) {
        EXPECT_EQ(HostSim_CheckProfileFile(example.path().c_str(), error, sizeof error), 0) << error;
    }
}

// TVX_HOST_PROFILE as each test sets it, unset afterwards.
class HostSimEnvironment : public HostSimTest {
protected:
    void TearDown() override {
        unsetenv("TVX_HOST_PROFILE");
        HostSimTest::TearDown();
    }
    static void select(const std::string &path) {
        setenv("TVX_HOST_PROFILE", path.c_str(), 1);
        HostSim_ResetProfile();
    }
};

// Unset or empty, the built-in profile; otherwise the named file, and one
// that cannot be read fails every node call and says so once.
TEST_F(HostSimEnvironment, SelectsTheBuiltInProfileOrTheNamedFile) {
    const nlohmann::json file = nlohmann::json::parse(std::ifstream(HOSTSIM_PROFILE_DIR "/default.json"));
    std::vector<std::string> names;
    for (const nlohmann::json &adapter : file["adapters"]) names.push_back(adapter["name"]);
    unsetenv("TVX_HOST_PROFILE");
    HostSim_ResetProfile();
    EXPECT_EQ(servedAdapterNames(), names);
    select("");
    EXPECT_EQ(servedAdapterNames(), names);
    EXPECT_EQ(HostType_OSIsOSK(), 1);
    select(HOSTSIM_PROFILE_DIR "/corla.json");
    EXPECT_EQ(HostType_OSIsOSK(), 0);

    const std::string path = ::testing::TempDir() + "hostsim-absent.json";
    select(path);
    ::testing::internal::CaptureStderr();
    char area[21];
    int status = -1;
    EXPECT_EQ(PRB_CheckSig(area, sizeof area, &status), HOSTSIM_STATUS_NO_PROFILE);
    EXPECT_EQ(PRB_CheckSig(area, sizeof area, &status), HOSTSIM_STATUS_NO_PROFILE);
    EXPECT_EQ(instanceList(70, &status), nullptr);
    EXPECT_EQ(status, HOSTSIM_STATUS_NO_PROFILE);
    int hasConsole = -1;
    EXPECT_EQ(OskuserCompat_InCOS(&hasConsole), HOSTSIM_STATUS_NO_PROFILE);
    EXPECT_EQ(hasConsole, 0);
    EXPECT_NE(listOf({"vmnic0"}), nullptr) << "lists still work";
    EXPECT_EQ(::testing::internal::GetCapturedStderr(), "hostsim: " + path + ": No such file or directory\n");
}

}  // namespace
}  // namespace hostsim_test
