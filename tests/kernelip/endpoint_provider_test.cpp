// The kernel IP endpoints through the embedded broker and the shipped
// library: how getInstance matches "Name". Which records each class takes
// and their values on the default host are the consistency suite's and the
// demo's, a failing inventory the fault sweep's.
#include "ProductBroker.h"

namespace {

using namespace producttest;

constexpr const char *kV4 = "Talvex_KernelIPv4ProtocolEndpoint";
constexpr const char *kV6 = "Talvex_KernelIPv6ProtocolEndpoint";
constexpr const char *kUnserved = "Test_UnservedEndpoint";

const std::string kLongName = "vmk" + std::string(148, 'x');  // 151 characters

class EndpointProvider : public ProductBroker {
protected:
    EndpointProvider() : ProductBroker(kV4, kUnserved) {}

    // vmk0: IPv4 and IPv6; vmk1: IPv6 only; then a name one character too long.
    void SetUp() override {
        ProductBroker::SetUp();
        serve(R"({"hostType": "Corlai", "ipInterfaces": [
            {"name": "vmk0", "ipv4Address": "10.0.0.1", "ipv4Netmask": "255.255.255.0",
             "ipv6": [{"address": "fe80::1", "prefixLength": 64}]},
            {"name": "vmk1", "ipv6": [{"address": "fe80::2", "prefixLength": 128}]},
            {"name": ")" + kLongName + R"(", "ipv4Address": "192.168.1.1", "ipv4Netmask": "255.255.0.0"}]})");
    }
};

TEST_F(EndpointProvider, GetInstanceTakesTheFirstRecordOfItsClassAndName) {
    const struct {
        const char *cls;
        std::string name;
        const char *address;  // of the answer; null: NOT_FOUND
    } cases[] = {
        {kV4, "vmk0", "10.0.0.1"},
        {kV6, "vmk1", "fe80::2"},
        {kV4, "vmk1", nullptr},
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
        EXPECT_EQ(found.path.className, c.cls);
    }
}

}  // namespace
