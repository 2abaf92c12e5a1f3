// The endpoint walk against the stand-in host: per interface its IPv4
// record, then its IPv6 records; every fault giving its result with the
// records read before it, the status word deciding the result of a walk
// that reaches its end, and every list freed on every path; and IPv6 data
// as the kernel may hand it over: the node-244 record and a netmask.
#include <arpa/inet.h>

#include <algorithm>
#include <cstring>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "hostsim/HostSimControl.h"
#include "kernelip/GetEndpointDetails.h"
#include "kernelip/IPv6Address.h"
#include "kernelip/IPv6Record.h"

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
     "ipv6": [{"instance": "d", "address": "fd00::2", "prefixLength": 56},
              {"instance": "e", "address": "fd00::3", "prefixLength": 57}]})";
const std::string v4vmk0 = "vmk0 192.168.10.21/255.255.255.0", a = "vmk0 fe80::1/64", b = "vmk0 2001:db8::1/48",
                  c = "vmk1 2001:db8:1::5/64", v4vmk2 = "vmk2 10.0.0.2/255.0.0.0", d = "vmk2 fd00::2/56",
                  e = "vmk2 fd00::3/57";

TEST(EndpointInventory, EveryFaultGivesItsResultAndKeepsWhatWasRead) {
    const std::size_t foreignBefore = HostSim_ForeignDestroyCount();
    const struct {
        const char *faults;
        unsigned int result;
        std::vector<std::string> records;
        std::string interfaces = threeInterfaces;
    } cases[] = {
        {"", 0, {v4vmk0, a, b, c, v4vmk2, d, e}},
        {R"({"call": "PRB_Get", "node": 239, "instance": "vmk0"})", 0, {a, b, c, v4vmk2, d, e}},
        {R"({"call": "PRB_GetInstanceListAlloc", "node": 243, "instance": "vmk1", "noList": true})", 0,
         {v4vmk0, a, b, v4vmk2, d, e}},
        // Index 1 is first asked of vmk0's IPv6 list, then of the interface list.
        {R"({"call": "PRB_ParamListGetParam", "index": 1, "nth": 1})", 0, {v4vmk0, a, c, v4vmk2, d, e}},
        {R"({"call": "PRB_ParamListGetParam", "index": 1, "nth": 2})", 0, {v4vmk0, a, b, v4vmk2, d, e}},
        // The status word: a name that cannot be appended fails the walk
        // only when nothing is read after it; a null entry reads nothing.
        {R"({"call": "PRB_ParamListAddString", "text": "vmk0"})", 0, {c, v4vmk2, d, e}},
        {R"({"call": "PRB_ParamListAddString", "text": "vmk2"})", 1, {v4vmk0, a, b, c}},
        {R"({"call": "PRB_ParamListAddString", "text": "vmk1"}, {"call": "PRB_ParamListGetParam", "index": 2})", 1,
         {v4vmk0, a, b}},
        {R"({"call": "PRB_CheckSig"})", 1, {}},
        {"", 0, {}, ""},
    };
    for (const auto &row : cases) {
        SCOPED_TRACE(std::string(row.faults) + (row.interfaces.empty() ? " (no interfaces)" : ""));
        const std::string profile =
            R"({"hostType": "Corlai", "ipInterfaces": [)" + row.interfaces + R"(], "faults": [)" + row.faults + "]}";
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

// A text that fills its field with no terminator, a prefix length beyond a
// byte, and bytes past the prefix that must not be read.
TEST(IPv6Record, AddressTextAndLittleEndianPrefix) {
    const struct {
        std::string text;
        unsigned char prefix[4];
        const char *address;
        uint32_t prefixLength;
    } cases[] = {
        {"2001:db8::1", {0x78, 0x56, 0x34, 0x12}, "2001:db8::1", 0x12345678},
        // Printable prefix bytes, so a text read past its field would show them.
        {std::string(48, 'f'), {'7', '8', 0, 0}, "ffffffffffffffffffffffffffffffffffffffffffffffff", 0x3837},
        {"", {0xff, 0xff, 0xff, 0xff}, "", 0xffffffff},
    };
    for (const auto &row : cases) {
        unsigned char record[ipv6RecordSize];
        std::memset(record, 'x', sizeof record);
        std::memset(record, 0, 48);
        std::memcpy(record, row.text.data(), std::min<std::size_t>(row.text.size(), 48));
        std::memcpy(record + 48, row.prefix, sizeof row.prefix);
        endpointDetails endpoint;
        std::memset(&endpoint, 0x5a, sizeof endpoint);
        decodeIPv6Record(record, endpoint);
        EXPECT_STREQ(endpoint.ipv6Address, row.address) << row.text;
        EXPECT_EQ(endpoint.ipv6PrefixLength, row.prefixLength) << row.text;
    }
}

TEST(IPv6Netmask, PrefixIsTheRunOfLeadingOnesOrZeroWhenTheMaskIsNotContiguous) {
    const struct {
        const char *mask;
        int length;
        int prefix;
    } cases[] = {
        {"ffff:fe00::", 16, 23},
        {"ffff:ffff:ffff:ffff:ffff:ffff:ffff:ffff", 16, 128},
        {"ff00:ff00::", 16, 0},  // a one in a byte after the partial one
        {"ff81::", 16, 0},       // a one after a zero in the partial byte
        {"ffff:0001::", 2, 16},  // bytes beyond the length are not read
        {"ffff::", -1, 0},
    };
    for (const auto &row : cases) {
        in6_addr mask{};
        ASSERT_EQ(inet_pton(AF_INET6, row.mask, &mask), 1) << row.mask;
        EXPECT_EQ(IPv6Address::getPrefix(&mask, row.length), row.prefix) << row.mask << " over " << row.length;
    }
}

}  // namespace
}  // namespace TVX
