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

using HostSimProfiles = HostSimTest;

// One refusal of each kind, so that a test's mistyped profile cannot pass
// for another host, and a bound that keeps a list from growing past what
// the nodes serve.
TEST_F(HostSimProfiles, GarbledProfilesAreRefusedNamingTheField) {
    const std::pair<std::string, std::string> cases[] = {
        {"{", "not valid JSON: line 1, column 2: syntax error"},
        {R"({"hostType": "Corla", "adaptres": []})", "adaptres: unknown field"},
        {with("adapters", R"([{"name": "a", "speedMbps": 70000}])"),
         "adapters[0].speedMbps: expected an integer from 0 to 65535 (or hexadecimal text such as \"0x1f\"), "
         "got 70000"},
        {with("adapters", R"([{"name": "a", "count": 3}, {"name": "a1"}])"),
         R"(adapters[1].name: duplicate adapter name "a1")"},
        {with("processors", R"({"packages": [{"cores": [{"count": 100000}, {}]}]})"),
         "processors: more than 100000 cores"},
        {with("watchedElements", R"([{"class": "C", "keys": [{"name": "K", "value": "a\u0000"}]}])"),
         "watchedElements[0].keys[0].value: expected a text of at most 255 bytes without NUL"},
        {with("watchedElements", R"([{"class": "C", "healthStates": [5, 5.5]}])"),
         R"(watchedElements[0].healthStates[1]: expected an integer, null, "missing", a text, true or false, got 5.5)"},
    };
    serve(host({{{"name", "kept"}}}));
    for (const auto &[json, message] : cases) EXPECT_THAT(loadError(json), StartsWith(message)) << json;
    EXPECT_EQ(adapterNames(), std::vector<std::string>{"kept"}) << "a refused profile replaces nothing";
}

// Inputs a fuzzer found: numbers beyond a double are refused as the syntax
// errors are, with their place; an entry's texts are held once however many
// adapters its count makes, and a name, which every list call hands out for
// each adapter, is bounded.
TEST_F(HostSimProfiles, FuzzedProfilesAreRefusedOrServedWithoutBlowingUp) {
    const std::string texts = std::string(4096, 'x');
    nlohmann::json amplified = {{"hostType", "Corlai"},
                                {"adapters", {{{"name", std::string(4096, 'n')}, {"count", 100000}}}}};
    for (const char *field : {"driverName", "driverVersion", "firmwareVersion", "interfaceName", "mac"}) {
        amplified["adapters"][0][field] = texts;
    }
    const std::pair<std::string, std::string> cases[] = {
        {R"({"hostType":"Corlai","hostName":1e400})",
         "not valid JSON: line 1, column 37: number overflow parsing '1e400'"},
        {amplified.dump(), "adapters[0].name: expected a text of at most 255 bytes, got 4096"},
    };
    for (const auto &[json, message] : cases) EXPECT_EQ(loadError(json), message) << json.substr(0, 80);

    const std::string path = ::testing::TempDir() + "overflow.json";
    std::ofstream(path) << cases[0].first;
    char error[256];
    EXPECT_NE(HostSim_CheckProfileFile(path.c_str(), error, sizeof error), 0);
    EXPECT_EQ(error, path + ": " + cases[0].second);

    amplified["adapters"][0]["name"] = "vmnic";
    serve(amplified);
    Bytes record(1252);
    ASSERT_EQ(readNode(72, {std::string("vmnic99999")}, record), 0);
    EXPECT_EQ(std::string(record.begin(), record.begin() + 32), texts.substr(0, 32));
}

// Every example profile stays valid, and a file is read as text is.
TEST_F(HostSimProfiles, ExampleFilesAreValidAndServed) {
    char error[256];
    for (const auto &example : std::filesystem::directory_iterator(HOSTSIM_PROFILE_DIR)) {
        EXPECT_EQ(HostSim_CheckProfileFile(example.path().c_str(), error, sizeof error), 0) << error;
    }
    const std::string directory = ::testing::TempDir();
    EXPECT_NE(HostSim_LoadProfileFile(directory.c_str(), error, sizeof error), 0);
    EXPECT_THAT(error, StartsWith(directory + ": not a regular file"));
    EXPECT_EQ(HostSim_LoadProfileFile(HOSTSIM_PROFILE_DIR "/corla.json", nullptr, 0), 0);
    EXPECT_EQ(HostType_OSIsOSK(), 0);
}

// The named file is served; one that cannot be read fails every node call
// and says so once. The demo's test runs on the built-in profile.
TEST_F(HostSimProfiles, TheEnvironmentNamesTheProfileFile) {
    const auto select = [](const std::string &path) {
        setenv("TVX_HOST_PROFILE", path.c_str(), 1);
        HostSim_ResetProfile();
    };
    select(HOSTSIM_PROFILE_DIR "/corla.json");
    EXPECT_EQ(HostType_OSIsOSK(), 0);
    const std::string path = ::testing::TempDir() + "hostsim-absent.json";
    select(path);
    ::testing::internal::CaptureStderr();
    char area[21];
    EXPECT_EQ(PRB_CheckSig(area, sizeof area, nullptr), HOSTSIM_STATUS_NO_PROFILE);
    PRB_ParamList *list = nullptr;
    EXPECT_EQ(PRB_GetInstanceListAlloc(70, nullptr, &list), HOSTSIM_STATUS_NO_PROFILE);
    EXPECT_EQ(list, nullptr);
    EXPECT_EQ(::testing::internal::GetCapturedStderr(), "hostsim: " + path + ": No such file or directory\n");
    unsetenv("TVX_HOST_PROFILE");
}

}  // namespace
}  // namespace hostsim_test
