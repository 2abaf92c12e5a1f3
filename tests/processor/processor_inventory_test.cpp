// The package walk against the stand-in host: which core supplies each
// package's CPUID data, where the core-state walk stops, a core count the
// core list cannot hold, and an empty package list, with no list left.
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "hostsim/HostSimControl.h"
#include "processor/GetProcessorDetails.h"

namespace Processor {
namespace {

const char *const intel = R"({"vendor": "GenuineIntel", "stepping": 1, "leaf1Ebx": "0x0a",
                             "leaf1Ecx": "0x20", "extendedEdx": "0x20100000"})";
const char *const amd = R"({"vendor": "AuthenticAMD", "stepping": 2, "leaf1Ebx": "0x0b"})";

std::string host(const std::string &packages, const std::string &faults = "") {
    return R"({"hostType": "Corlai", "processors": {"hardwareThreads": true,
        "modelText": "Xeon\tE5", "powerPolicy": "Dynamic", "packages": )" +
           packages + R"(}, "faults": [)" + faults + "]}";
}

// Two packages of four cores with instance numbers unlike their positions.
// Only the first core of each package has the package's own CPUID; in the
// second package core 105 is the first busy one and 106 would fail if read.
std::string twoPackages(const std::string &faults = "") {
    return host(std::string(R"([
        {"instance": 30, "cores": [
            {"instance": 100, "cpuid": )") + intel + R"(},
            {"instance": 101, "cpuid": )" + amd + R"(},
            {"instance": 102, "cpuid": )" + amd + R"(},
            {"instance": 103, "cpuid": )" + amd + R"(}]},
        {"instance": 31, "cpuid": )" + intel + R"(, "cores": [
            {"instance": 104, "cpuid": )" + amd + R"(},
            {"instance": 105, "state": 1},
            {"instance": 106, "state": 1},
            {"instance": 107}]}])",
                faults);
}

struct Taken {
    unsigned int result;
    std::vector<std::string> records;  // what tells the packages apart
};

class ProcessorInventory : public testing::Test {
protected:
    void TearDown() override {
        EXPECT_EQ(HostSim_LiveListCount(), 0u) << "a list was not freed";
        HostSim_ResetProfile();
    }

    static Taken take(const std::string &profile) {
        char error[256];
        EXPECT_EQ(HostSim_LoadProfileText(profile.c_str(), error, sizeof error), 0) << error;
        std::vector<ProcessorDetails> records;
        Taken taken{getProcessorDetails(records), {}};
        for (const ProcessorDetails &r : records) {
            taken.records.push_back(std::string(r.deviceId) + " cores " + std::to_string(r.enabledCores) +
                                    " vendor " + std::to_string(r.vendor) + " brand " + std::to_string(r.brandId) +
                                    " vt " + std::to_string(r.virtualization) + " status " + std::to_string(r.cpuStatus));
        }
        return taken;
    }
};

using Records = std::vector<std::string>;

TEST_F(ProcessorInventory, WalksEachPackageFromWhereItStartsInTheCoreList) {
    const struct {
        const char *what;
        std::string profile;
        unsigned int result;
        Records records;
    } cases[] = {
        // cpu-1 has core 104's own CPUID, not its package's.
        {"first core's CPUID, first busy core's state",
         twoPackages(R"({"call": "PRB_Get", "node": 799, "instance": 106},
                        {"call": "PRB_Get", "node": 800, "instance": 106})"),
         0, {"cpu-0 cores 4 vendor 2 brand 10 vt 1 status 4", "cpu-1 cores 4 vendor 3 brand 11 vt 0 status 1"}},
        // The first package claims no cores, so the second starts at entry 0
        // too; had the first asked, the second package's query would fail.
        {"a package of no cores",
         host(std::string(R"([
            {"coreCount": 0, "cores": [{"cpuid": )") + intel + R"(, "state": 1}]},
            {"coreCount": 1, "cores": [{"cpuid": )" + amd + R"(}]}])",
              R"({"call": "PRB_Get", "node": 799, "nth": 2})"),
         0, {"cpu-0 cores 0 vendor 2 brand 10 vt 1 status 4", "cpu-1 cores 1 vendor 2 brand 10 vt 1 status 1"}},
        {"a core count beyond the core list fails instead of running on",
         host(R"([{"coreCount": "0xffffffff", "cores": [{}, {}]}])"), 1,
         {"cpu-0 cores 4294967295 vendor 1 brand 0 vt 0 status 4"}},
        {"an empty package list on a sound host", host("[]"), 0, {}},
    };
    for (const auto &c : cases) {
        const Taken taken = take(c.profile);
        EXPECT_EQ(taken.result, c.result) << c.what;
        EXPECT_EQ(taken.records, c.records) << c.what;
        EXPECT_EQ(HostSim_LiveListCount(), 0u) << c.what;
    }
}

}  // namespace
}  // namespace Processor
