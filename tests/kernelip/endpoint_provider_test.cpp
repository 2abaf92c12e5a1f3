// The kernel IP endpoints through the embedded broker and the shipped
// library: which records each class name takes and in what order, the
// values clients read, how getInstance matches "Name", and the answers for
// parent and unknown classes and a failing inventory.
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
        ProviderRegistration endpoint;
        for (auto it = config.registrations.begin(); it != config.registrations.end();) {
            if (it->providerName != "KernelIPProtocolEndpointProvider") {
                ++it;
                continue;
            }
            endpoint = *it;
            it = config.registrations.erase(it);
        }
        for (const std::string &className : classNames) {
            endpoint.className = className;
            config.registrations.push_back(endpoint);
        }
        broker = std::make_unique<Broker>(std::move(config));
    }

    // "class Name IPv4Address|IPv6Address" of each instance, in answer order.
    std::vector<std::string> enumerate(const std::string &cls) const {
        const Response response = broker->enumInstances(classPath(cls), {});
        EXPECT_TRUE(response.ok()) << cls << " " << response.rc;
        std::vector<std::string> shown;
        for (const Instance &instance : response.instances) {
            const CimValue *v4 = instance.property("IPv4Address");
            const CimValue *v6 = instance.property("IPv6Address");
            shown.push_back(instance.path.className + " " + instance.property("Name")->text + " " +
                            (v4 != nullptr && !v4->null ? v4->text : v6->text));
        }
        return shown;
    }
};

TEST_F(EndpointProvider, EachClassNameTakesItsRecordsInRecordOrder) {
    serve(host());
    const std::string longV4 = std::string(kV4) + " " + kLongName.substr(0, 150) + " 192.168.1.1";
    const std::vector<std::string> v4 = {std::string(kV4) + " vmk0 10.0.0.1", std::string(kV4) + " vmk2 0.0.0.0",
                                         longV4};
    const std::vector<std::string> v6 = {std::string(kV6) + " vmk0 fe80::1", std::string(kV6) + " vmk0 2001:db8::1",
                                         std::string(kV6) + " vmk1 fe80::2"};
    const std::vector<std::string> both = {v4[0], v6[0], v6[1], v6[2], v4[1], v4[2]};
    const struct {
        const char *registered;
        std::vector<std::string> expected;
    } cases[] = {
        {kV4, v4},
        {"TALVEX_KERNELIPV6PROTOCOLENDPOINT", v6},
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

TEST_F(EndpointProvider, ValuesPerFamilyAsClientsReadThem) {
    serve(host());
    registerFor({kParent});
    const Response response = broker->enumInstances(classPath(kParent), {});
    ASSERT_EQ(response.instances.size(), 6u);
    const auto v4 = literals(response.instances[0]);
    const auto v6 = literals(response.instances[2]);
    const auto unset = literals(response.instances[4]);
    const struct {
        const std::map<std::string, std::string> &instance;
        const char *property;
        const char *literal;  // null: absent
    } cases[] = {
        {v4, "Name", "\"vmk0\""},
        {v4, "ElementName", "\"vmk0\""},
        {v4, "CreationClassName", "\"Talvex_KernelIPv4ProtocolEndpoint\""},
        {v4, "SystemCreationClassName", "\"OMC_UnitaryComputerSystem\""},
        {v4, "NameFormat", "\"Ostrakon Interface Name\""},
        {v4, "ProtocolIFType", "4096"},
        {v4, "SubnetMask", "\"255.255.255.0\""},
        {v4, "EnabledState", "5"},
        {v4, "IPv6Address", nullptr},
        {v4, "PrefixLength", nullptr},
        {unset, "IPv4Address", "\"0.0.0.0\""},
        {unset, "EnabledState", "6"},
        {v6, "CreationClassName", "\"Talvex_KernelIPv6ProtocolEndpoint\""},
        {v6, "ProtocolIFType", "4097"},
        {v6, "IPv6Address", "\"2001:db8::1\""},
        {v6, "PrefixLength", "44"},
        {v6, "EnabledState", "5"},
        {v6, "IPv4Address", nullptr},
        {v6, "SubnetMask", nullptr},
    };
    for (const auto &c : cases) {
        const auto found = c.instance.find(c.property);
        if (c.literal == nullptr) {
            EXPECT_TRUE(found == c.instance.end()) << c.property << " = " << found->second;
        } else {
            ASSERT_TRUE(found != c.instance.end()) << c.property;
            EXPECT_EQ(found->second, c.literal) << c.property;
        }
    }
    EXPECT_EQ(response.instances[0].property("SystemName")->text, hostName);
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
