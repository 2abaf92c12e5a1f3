// The kernel IP endpoints through the embedded broker and the shipped
// library: which records each class takes and in what order, the values
// clients read, how getInstance matches "Name", and the answers for another
// class and a failing inventory.
#include "ProductBroker.h"

namespace {

using namespace producttest;

constexpr const char *kV4 = "Talvex_KernelIPv4ProtocolEndpoint";
constexpr const char *kV6 = "Talvex_KernelIPv6ProtocolEndpoint";
constexpr const char *kUnserved = "Test_UnservedEndpoint";

const std::string kLongName = "vmk" + std::string(148, 'x');  // 151 characters

// vmk0: IPv4 and two IPv6, one with a prefix above 255; vmk1: IPv6 only;
// vmk2 at 0.0.0.0; then a name one character too long.
std::string host(const std::string &faults = "") {
    return R"({"hostType": "Corlai", "faults": [)" + faults + R"(], "ipInterfaces": [
        {"name": "vmk0", "ipv4Address": "10.0.0.1", "ipv4Netmask": "255.255.255.0",
         "ipv6": [{"address": "fe80::1", "prefixLength": 64},
                  {"address": "2001:db8::1", "prefixLength": 300}]},
        {"name": "vmk1", "ipv6": [{"address": "fe80::2", "prefixLength": 128}]},
        {"name": "vmk2", "ipv4Address": "0.0.0.0", "ipv4Netmask": "0.0.0.0"},
        {"name": ")" + kLongName + R"(", "ipv4Address": "192.168.1.1", "ipv4Netmask": "255.255.0.0"}]})";
}

class EndpointProvider : public ProductBroker {
protected:
    EndpointProvider() : ProductBroker(kV4, kUnserved) {}

    // "class Name ProtocolIFType <IPv4Address SubnetMask | IPv6Address
    // PrefixLength> EnabledState" of each instance as MOF literals, in answer order.
    std::vector<std::string> enumerate(const std::string &cls) const {
        const Response response = broker->enumInstances(classPath(cls), {});
        EXPECT_TRUE(response.ok()) << cls << " " << response.rc;
        std::vector<std::string> shown;
        for (const Instance &instance : response.instances) {
            const std::map<std::string, std::string> values = literals(instance);
            std::string line = instance.path.className;
            for (const char *property : {"Name", "ProtocolIFType", "IPv4Address", "SubnetMask", "IPv6Address",
                                         "PrefixLength", "EnabledState"}) {
                if (values.count(property) != 0) line += " " + values.at(property);
            }
            shown.push_back(line);
        }
        return shown;
    }
};

// EnabledState is 6 at 0.0.0.0 only; a prefix length keeps its low 8 bits.
TEST_F(EndpointProvider, EachClassTakesItsRecordsInRecordOrder) {
    serve(host());
    const std::string v4 = std::string(kV4) + " \"", v6 = std::string(kV6) + " \"";
    EXPECT_EQ(enumerate(kV4), (std::vector<std::string>{
                                  v4 + R"(vmk0" 4096 "10.0.0.1" "255.255.255.0" 5)", v4 + R"(vmk2" 4096 "0.0.0.0" "0.0.0.0" 6)",
                                  v4 + kLongName.substr(0, 150) + R"(" 4096 "192.168.1.1" "255.255.0.0" 5)"}));
    EXPECT_EQ(enumerate(kV6), (std::vector<std::string>{v6 + R"(vmk0" 4097 "fe80::1" 64 5)",
                                                        v6 + R"(vmk0" 4097 "2001:db8::1" 44 5)",
                                                        v6 + R"(vmk1" 4097 "fe80::2" 128 5)"}));
    EXPECT_EQ(enumerate(kUnserved), std::vector<std::string>{});
}

TEST_F(EndpointProvider, GetInstanceTakesTheFirstRecordOfItsClassAndName) {
    serve(host());
    const struct {
        const char *cls;
        std::string name;
        const char *address;  // of the answer; null: NOT_FOUND
    } cases[] = {
        {kV4, "vmk0", "10.0.0.1"},
        {"talvex_kernelipv6protocolendpoint", "vmk1", "fe80::2"},
        {kV4, "vmk1", nullptr},
        {kV4, "VMK0", nullptr},
        {kV4, kLongName.substr(0, 150) + "yz", "192.168.1.1"},
        {kV4, kLongName.substr(0, 149), nullptr},
        {kUnserved, "vmk0", nullptr},  // OK with nothing, as a client sees it
    };
    for (const auto &c : cases) {
        const ObjectPath path{"", kNs, c.cls, {{"Name", CimValue::makeString(c.name)}}};
        const Response response = broker->getInstance(path, {});
        EXPECT_EQ(response.rc, c.address ? CMPI_RC_OK : CMPI_RC_ERR_NOT_FOUND) << c.cls << " " << c.name;
        ASSERT_EQ(response.instances.size(), c.address ? 1u : 0u) << c.cls << " " << c.name;
        if (c.address == nullptr) continue;
        const Instance &found = response.instances[0];
        const CimValue *v4 = found.property("IPv4Address");
        EXPECT_EQ(v4 != nullptr ? v4->text : found.property("IPv6Address")->text, c.address);
        EXPECT_TRUE(equalsIgnoreCase(found.path.className, c.cls));
    }
}

TEST_F(EndpointProvider, AFailingInventoryAnswersNothing) {
    serve(host(R"({"call": "PRB_CheckSig"})"));
    EXPECT_TRUE(enumerate(kV4).empty());
    EXPECT_TRUE(broker->enumInstanceNames(classPath(kV4)).paths.empty());
    const ObjectPath vmk0{"", kNs, kV4, {{"Name", CimValue::makeString("vmk0")}}};
    EXPECT_EQ(broker->getInstance(vmk0, {}).rc, CMPI_RC_ERR_NOT_FOUND);
}

}  // namespace
