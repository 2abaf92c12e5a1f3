// The kernel IP endpoints through the embedded broker and the shipped
// library: which records each class name takes and in what order, the
// values clients read, how getInstance matches "Name", and the answers for
// parent and unknown classes and a failing inventory.
#include <algorithm>
#include <thread>

#include "ProductBroker.h"

namespace {

using namespace producttest;

constexpr const char *kV4 = "Talvex_KernelIPv4ProtocolEndpoint";
constexpr const char *kV6 = "Talvex_KernelIPv6ProtocolEndpoint";
constexpr const char *kParent = "Talvex_KernelIPProtocolEndpoint";
constexpr const char *kCimParent = "CIM_IPProtocolEndpoint";
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

    // The provider registered for exactly these class spellings, so that a
    // request reaches it with a parent class's name as the client wrote it.
    void registerFor(const std::vector<std::string> &classNames) {
        broker->shutdown();
        BrokerConfig config =
            loadBrokerConfig({TVX_PROVIDER_DIR}, TVX_PROVIDER_REG, {TVX_PRODUCT_MOFS, TVX_TEST_MOF});
        auto &registrations = config.registrations;
        const auto isEndpoint = [](const ProviderRegistration &registration) {
            return registration.providerName == "KernelIPProtocolEndpointProvider";
        };
        const auto found = std::find_if(registrations.begin(), registrations.end(), isEndpoint);
        ASSERT_NE(found, registrations.end());
        ProviderRegistration endpoint = *found;
        registrations.erase(std::remove_if(registrations.begin(), registrations.end(), isEndpoint),
                            registrations.end());
        for (const std::string &className : classNames) {
            endpoint.className = className;
            registrations.push_back(endpoint);
        }
        broker = std::make_unique<Broker>(std::move(config));
    }

    // "class Name ProtocolIFType <IPv4Address SubnetMask | IPv6Address
    // PrefixLength> EnabledState" of each instance as MOF literals, in answer order.
    std::vector<std::string> enumerate(const std::string &cls) const {
        const Response response = broker->enumInstances(classPath(cls), {});
        EXPECT_TRUE(response.ok()) << cls << " " << response.rc;
        std::vector<std::string> shown;
        for (const Instance &instance : response.instances) {
            const std::map<std::string, std::string> values = literals(instance);
            EXPECT_EQ(values.at("CreationClassName"), '"' + instance.path.className + '"');
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
TEST_F(EndpointProvider, EachClassNameTakesItsRecordsInRecordOrder) {
    serve(host());
    const std::string v4 = std::string(kV4) + " \"", v6 = std::string(kV6) + " \"";
    const std::vector<std::string> ipv4 = {v4 + R"(vmk0" 4096 "10.0.0.1" "255.255.255.0" 5)",
                                           v4 + R"(vmk2" 4096 "0.0.0.0" "0.0.0.0" 6)",
                                           v4 + kLongName.substr(0, 150) + R"(" 4096 "192.168.1.1" "255.255.0.0" 5)"};
    const std::vector<std::string> ipv6 = {v6 + R"(vmk0" 4097 "fe80::1" 64 5)", v6 + R"(vmk0" 4097 "2001:db8::1" 44 5)",
                                           v6 + R"(vmk1" 4097 "fe80::2" 128 5)"};
    const std::vector<std::string> both = {ipv4[0], ipv6[0], ipv6[1], ipv6[2], ipv4[1], ipv4[2]};
    const struct {
        const char *registered;
        std::vector<std::string> expected;
    } cases[] = {
        {kV4, ipv4},
        {"TALVEX_KERNELIPV6PROTOCOLENDPOINT", ipv6},
        {kParent, both},
        {"talvex_kernelipprotocolendpoint", both},
        {kCimParent, both},
        {kUnserved, {}},
    };
    for (const auto &c : cases) {
        registerFor({c.registered});
        EXPECT_EQ(enumerate(c.registered), c.expected) << c.registered;
        const Response names = broker->enumInstanceNames(classPath(c.registered));
        EXPECT_EQ(names.paths.size(), c.expected.size()) << c.registered;
    }
}

TEST_F(EndpointProvider, SharedValuesAsClientsReadThem) {
    serve(host());
    const Response response = broker->enumInstances(classPath(kV4), {});
    ASSERT_FALSE(response.instances.empty());
    std::map<std::string, std::string> values = literals(response.instances[0]);
    const std::map<std::string, std::string> expected = {{"ElementName", "\"vmk0\""},
                                                         {"SystemCreationClassName", "\"OMC_UnitaryComputerSystem\""},
                                                         {"SystemName", '"' + hostName + '"'},
                                                         {"NameFormat", "\"Ostrakon Interface Name\""}};
    for (const auto &[property, literal] : expected) EXPECT_EQ(values[property], literal) << property;
}

TEST_F(EndpointProvider, GetInstanceTakesTheFirstRecordOfItsClassAndName) {
    serve(host());
    registerFor({kV4, kV6, kParent});
    const struct {
        const char *cls;
        std::string name;
        CMPIrc rc;
        const char *address;  // of the answer; null: none
    } cases[] = {
        {kV4, "vmk0", CMPI_RC_OK, "10.0.0.1"},
        {kV6, "vmk0", CMPI_RC_OK, "fe80::1"},
        {"talvex_kernelipv6protocolendpoint", "vmk1", CMPI_RC_OK, "fe80::2"},
        {kV4, "vmk1", CMPI_RC_ERR_NOT_FOUND, nullptr},
        {kV6, "vmk2", CMPI_RC_ERR_NOT_FOUND, nullptr},
        {kV4, "VMK0", CMPI_RC_ERR_NOT_FOUND, nullptr},
        {kV4, kLongName, CMPI_RC_OK, "192.168.1.1"},
        {kV4, kLongName.substr(0, 150) + "yz", CMPI_RC_OK, "192.168.1.1"},
        {kV4, kLongName.substr(0, 149), CMPI_RC_ERR_NOT_FOUND, nullptr},
        {kParent, "vmk0", CMPI_RC_ERR_NOT_FOUND, nullptr},  // OK with nothing, as a client sees it
    };
    for (const auto &c : cases) {
        const ObjectPath path{"", kNs, c.cls, {{"Name", CimValue::makeString(c.name)}}};
        const Response response = broker->getInstance(path, {});
        EXPECT_EQ(response.rc, c.rc) << c.cls << " " << c.name;
        ASSERT_EQ(response.instances.size(), c.address ? 1u : 0u) << c.cls << " " << c.name;
        if (c.address == nullptr) continue;
        const Instance &found = response.instances[0];
        const CimValue *v4 = found.property("IPv4Address");
        EXPECT_EQ(v4 != nullptr ? v4->text : found.property("IPv6Address")->text, c.address);
        EXPECT_TRUE(equalsIgnoreCase(found.path.className, c.cls));
    }
}

TEST_F(EndpointProvider, AFailingInventoryAnswersNothing) {
    const ObjectPath vmk0{"", kNs, kV4, {{"Name", CimValue::makeString("vmk0")}}};
    for (const char *fault : {R"({"call": "PRB_CheckSig"})", R"({"call": "PRB_GetInstanceListAlloc", "node": 214})",
                              R"({"call": "PRB_Get", "node": 244})"}) {
        serve(host(fault));
        EXPECT_TRUE(enumerate(kV4).empty()) << fault;
        EXPECT_TRUE(broker->enumInstanceNames(classPath(kV4)).paths.empty()) << fault;
        EXPECT_EQ(broker->getInstance(vmk0, {}).rc, CMPI_RC_ERR_NOT_FOUND) << fault;
    }
}

// The dotted-decimal texts are made per request: requests converting at the
// same moment must each read their own addresses.
TEST_F(EndpointProvider, ConcurrentRequestsKeepTheirOwnAddressTexts) {
    serve(host());
    const std::vector<std::string> expected = enumerate(kV4);
    ASSERT_EQ(expected.size(), 3u);
    std::vector<std::vector<std::string>> seen(4);
    std::vector<std::thread> threads;
    for (auto &answers : seen) {
        threads.emplace_back([&] {
            for (int round = 0; round < 25; ++round) {
                const std::vector<std::string> got = enumerate(kV4);
                if (got != expected) answers = got;
            }
        });
    }
    for (std::thread &thread : threads) thread.join();
    for (const auto &answers : seen) EXPECT_TRUE(answers.empty());
}

}  // namespace
