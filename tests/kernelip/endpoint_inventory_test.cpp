// The endpoint walk against the stand-in host, whose records are laid out
// as the kernel lays them out: per interface its IPv4 record, then its IPv6
// records, one with a text that fills its field with no terminator (before
// a prefix whose bytes are printable) and one with a prefix beyond a byte;
// and the status word deciding the result of a walk that reaches its end,
// with the records read before a fault (each fault at each position under
// each request is the fault sweep's).
#include <arpa/inet.h>

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "hostsim/HostSimControl.h"
#include "kernelip/GetEndpointDetails.h"

namespace TVX {
namespace {

// "vmk0 192.168.10.21/255.255.255.0" or "vmk0 fe80::1/64".
std::string describe(const endpointDetails &record) {
    if (record.protocolType == protocolIPv6) {
        return std::string(record.name) + " " + record.ipv6Address + "/" + std::to_string(record.ipv6PrefixLength);
    }
    EXPECT_EQ(record.protocolType, protocolIPv4) << record.name;
    char address[INET_ADDRSTRLEN];
    char netmask[INET_ADDRSTRLEN];
    inet_ntop(AF_INET, &record.ipv4Address, address, sizeof address);
    inet_ntop(AF_INET, &record.ipv4Netmask, netmask, sizeof netmask);
    return std::string(record.name) + " " + address + "/" + netmask;
}

const std::string threeInterfaces = R"(
    {"name": "vmk0", "ipv4Address": "192.168.10.21", "ipv4Netmask": "255.255.255.0",
     "ipv6": [{"instance": "a", "address": "fe80::1"},
              {"instance": "b", "address": "2001:db8::1", "prefixLength": 48}]},
    {"name": "vmk1", "ipv6": [{"instance": "c", "address": "2001:db8:1::5"}]},
    {"name": "vmk2", "ipv4Address": "10.0.0.2", "ipv4Netmask": "255.0.0.0",
     "ipv6": [{"instance": "d", "address": "fd00::2", "prefixLength": 305419896},
              {"instance": "e", "address": "ffffffffffffffffffffffffffffffffffffffffffffffff", "prefixLength": 57}]})";
const std::string v4vmk0 = "vmk0 192.168.10.21/255.255.255.0", a = "vmk0 fe80::1/64", b = "vmk0 2001:db8::1/48",
                  c = "vmk1 2001:db8:1::5/64", v4vmk2 = "vmk2 10.0.0.2/255.0.0.0", d = "vmk2 fd00::2/305419896",
                  e = "vmk2 " + std::string(48, 'f') + "/57";

TEST(EndpointInventory, EveryFaultGivesItsResultAndKeepsWhatWasRead) {
    const std::size_t foreignBefore = HostSim_ForeignDestroyCount();
    const struct {
        const char *faults;
        unsigned int result;
        std::vector<std::string> records;
    } cases[] = {
        {"", 0, {v4vmk0, a, b, c, v4vmk2, d, e}},
        {R"({"call": "PRB_Get", "node": 239, "instance": "vmk0"})", 0, {a, b, c, v4vmk2, d, e}},
        // The status word: a name that cannot be appended fails the walk
        // only when nothing is read after it; a null entry reads nothing.
        {R"({"call": "PRB_ParamListAddString", "text": "vmk0"})", 0, {c, v4vmk2, d, e}},
        {R"({"call": "PRB_ParamListAddString", "text": "vmk2"})", 1, {v4vmk0, a, b, c}},
        {R"({"call": "PRB_CheckSig"})", 1, {}},
    };
    for (const auto &row : cases) {
        SCOPED_TRACE(row.faults);
        const std::string profile =
            R"({"hostType": "Corlai", "ipInterfaces": [)" + threeInterfaces + R"(], "faults": [)" + row.faults + "]}";
        char error[256] = "";
        ASSERT_EQ(HostSim_LoadProfileText(profile.c_str(), error, sizeof error), 0) << error;
        std::vector<endpointDetails> endpoints;
        EXPECT_EQ(getendpointDetails(endpoints), row.result);
        std::vector<std::string> records;
        for (const endpointDetails &record : endpoints) records.push_back(describe(record));
        EXPECT_EQ(records, row.records);
        EXPECT_EQ(HostSim_LiveListCount(), 0u) << "a list was not freed";
    }
    EXPECT_EQ(HostSim_ForeignDestroyCount(), foreignBefore) << "something not a live list was destroyed";
    HostSim_ResetProfile();
}

}  // namespace
}  // namespace TVX
