// One entry of the kernel's IP interfaces: an interface, or with a count the
// template every one of its interfaces is served from.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <unordered_map>
#include <vector>

namespace hostsim {

using Ipv4Bytes = std::array<unsigned char, 4>;  // network byte order

// Nodes 239 and 240.
struct Ipv4Profile {
    Ipv4Bytes address{};
    Ipv4Bytes netmask{};
};

// One IPv6 address: an entry of the node-243 list and its node-244 record.
struct Ipv6Profile {
    std::string instance;
    std::string address;  // any text, so malformed addresses can be served
    std::uint32_t prefixLength = 64;
};

struct InterfaceProfile {
    // With a count, the stem of the names <name>0 ... <name>N-1.
    std::string name;
    std::optional<std::uint32_t> count;
    std::optional<Ipv4Profile> ipv4;  // none: the interface has no IPv4 address
    std::vector<Ipv6Profile> ipv6;    // in node-243 order
    std::unordered_map<std::string, std::size_t> ipv6Index;  // instance -> position in ipv6

    const Ipv6Profile *findIpv6(const std::string &instance) const {
        const auto found = ipv6Index.find(instance);
        return found == ipv6Index.end() ? nullptr : &ipv6[found->second];
    }
};

}  // namespace hostsim
