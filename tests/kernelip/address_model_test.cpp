// The interface address objects: prefix lengths of IPv6 netmasks, and when
// two addresses are the same address. The endpoint instances they build are
// checked where an indication carries them.
#include <arpa/inet.h>
#include <gtest/gtest.h>

#include <memory>

#include "ScriptedInterfaceAddresses.h"
#include "kernelip/IPv4Address.h"
#include "kernelip/IPv6Address.h"

namespace kipdtest {
namespace {

using TVX::IAddress;
using TVX::IPv4Address;
using TVX::IPv6Address;

// Address objects made from one-entry lists, which they outlive.
std::unique_ptr<IAddress> v4(const char *address, const char *netmask = "255.255.255.0") {
    return std::make_unique<IPv4Address>(InterfaceAddressList({ipv4("vmk0", address, netmask)}).head());
}

std::unique_ptr<IAddress> v6(const char *address, const char *netmask = "ffff:ffff:ffff:ffff::") {
    return std::make_unique<IPv6Address>(InterfaceAddressList({ipv6("vmk0", address, netmask)}).head());
}

TEST(AddressModel, PrefixIsTheRunOfLeadingOnesOrZeroWhenTheMaskIsNotContiguous) {
    const struct {
        const char *mask;
        int length;
        int prefix;
    } cases[] = {
        {"ffff:ffff:ffff:ffff::", 16, 64},
        {"ffff:fe00::", 16, 23},
        {"::", 16, 0},
        {"ff00:ff00::", 16, 0},
        {"ff81::", 16, 0},                 // a one after a zero in the partial byte
        {"ffff:ffff:ffff:ffff:ffff:ffff:ffff:ffff", 16, 128},
        {"fffe:8000::", 16, 0},            // a one in the byte after the partial one
        {"ffff:ffff:ffff:ffff::1", 16, 0},  // a one in the last byte
        {"ffff:0001::", 2, 16},            // bytes beyond the length are not read
        {"ffff::", 0, 0},
        {"ffff::", -1, 0},
    };
    for (const auto &c : cases) {
        in6_addr mask{};
        ASSERT_EQ(inet_pton(AF_INET6, c.mask, &mask), 1) << c.mask;
        EXPECT_EQ(IPv6Address::getPrefix(&mask, c.length), c.prefix) << c.mask << " over " << c.length << " bytes";
    }
}

TEST(AddressModel, EqualityFollowsAddressAndIPv4NetmaskWithinOneFamily) {
    const struct {
        std::unique_ptr<IAddress> left, right;
        bool equal;
        const char *what;
    } cases[] = {
        {v4("10.0.0.1"), v4("10.0.0.1"), true, "same IPv4 address and netmask"},
        {v4("10.0.0.1"), v4("10.0.0.1", "255.255.0.0"), false, "IPv4 netmask differs"},
        {v4("10.0.0.1"), v4("10.0.0.2"), false, "IPv4 address differs"},
        {v6("fd00::1"), v6("fd00::1"), true, "same IPv6 address"},
        {v6("fd00::1"), v6("fd00::1", "ffff:ffff:ffff::"), true, "IPv6 prefix is ignored"},
        {v6("fd00::1"), v6("fd00::2"), false, "IPv6 address differs"},
        {v4("10.0.0.1"), v6("::ffff:10.0.0.1"), false, "the families never meet"},
        {v4("0.0.0.0", "0.0.0.0"), v6("::", "::"), false, "not even at zero"},
    };
    for (const auto &c : cases) {
        EXPECT_EQ(c.left->isEqual(c.right.get()), c.equal) << c.what;
        EXPECT_EQ(c.right->isEqual(c.left.get()), c.equal) << c.what << ", the other way";
        EXPECT_TRUE(c.left->isEqual(c.left.get())) << c.what;
        EXPECT_FALSE(c.left->isEqual(nullptr)) << c.what;
    }
}

}  // namespace
}  // namespace kipdtest
