// The package walk against the stand-in host, whose CPUID records are laid
// out as the kernel lays them out: which core supplies each package's CPUID
// data (an AMD core's leaf-1 VMX bit and another vendor's bits count for
// nothing), where the core-state walk stops, and a core count the core list
// cannot hold, with no list left.
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "hostsim/HostSimControl.h"
#include "processor/GetProcessorDetails.h"

namespace Processor {
namespace {

const char *const intel = R"({"vendor": "GenuineIntel", "stepping": 1, "leaf1Ebx": "0x0a",
                             "leaf1Ecx": "0x20", "extendedEdx": "0x20100000"})";
const char *const amd = R"({"vendor": "AuthenticAMD", "stepping": 2, "leaf1Ebx": "0x0b", "leaf1Ecx": "0x20"})";

std::string host(const std::string &packages, const std::string &faults = "") {
    return R"({"hostType": "Corlai", "processors": {"hardwareThreads": true,
        "modelText": "Xeon\tE5", "powerPolicy": "Dynamic", "packages": )" +
           packages + R"(}, "faults": [)" + faults + "]}";
}

TEST(ProcessorInventory, WalksEachPackageFromWhereItStartsInTheCoreList) {
    const struct {
        const char *what;
        std::string profile;
        unsigned int result;
        std::vector<std::string> records;
    } cases[] = {
        // Two packages of four cores with instance numbers unlike their
        // positions. Only the first core of each package has the package's
        // own CPUID, so cpu-1 has core 104's, not its package's; in the second
        // package core 105 is the first busy one and 106 would fail if read.
        {"first core's CPUID, first busy core's state",
         host(std::string(R"([
            {"instance": 30, "cores": [{"instance": 100, "cpuid": )") + intel + R"(},
                {"instance": 101, "cpuid": )" + amd + R"(}, {"instance": 102, "cpuid": )" + amd + R"(},
                {"instance": 103, "cpuid": )" + amd + R"(}]},
            {"instance": 31, "cpuid": )" + intel + R"(, "cores": [{"instance": 104, "cpuid": )" + amd + R"(},
                {"instance": 105, "state": 1}, {"instance": 106, "state": 1}, {"instance": 107}]}])",
              R"({"call": "PRB_Get", "node": 799, "instance": 106}, {"call": "PRB_Get", "node": 800, "instance": 106})"),
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
         host(R"([{"coreCount": "0xffffffff", "cores": [{"cpuid": {"vendor": "CentaurHauls", "leaf1Ebx": "0xff",
             "leaf1Ecx": "0xffffffff", "extendedEcx": "0xffffffff", "extendedEdx": "0xffffffff"}}, {}]}])"), 1,
         {"cpu-0 cores 4294967295 vendor 1 brand 0 vt 0 status 4"}},
    };
    for (const auto &c : cases) {
        char error[256];
        ASSERT_EQ(HostSim_LoadProfileText(c.profile.c_str(), error, sizeof error), 0) << error;
        std::vector<ProcessorDetails> details;
        EXPECT_EQ(getProcessorDetails(details), c.result) << c.what;
        std::vector<std::string> records;
        for (const ProcessorDetails &r : details) {
            records.push_back(std::string(r.deviceId) + " cores " + std::to_string(r.enabledCores) + " vendor " +
                              std::to_string(r.vendor) + " brand " + std::to_string(r.brandId) + " vt " +
                              std::to_string(r.virtualization) + " status " + std::to_string(r.cpuStatus));
        }
        EXPECT_EQ(records, c.records) << c.what;
        EXPECT_EQ(HostSim_LiveListCount(), 0u) << c.what;
    }
    HostSim_ResetProfile();
}

}  // namespace
}  // namespace Processor
