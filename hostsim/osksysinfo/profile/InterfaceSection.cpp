// "ipInterfaces": the kernel's IP interfaces, in instance-list order, with
// their IPv4 address and netmask and their IPv6 addresses. An entry with
// "count" N stands for N interfaces named <name>0 ... <name>N-1 that are all
// served from that one entry.
#include <arpa/inet.h>

#include <cstring>
#include <memory>
#include <string>

#include "profile/FieldReading.h"
#include "profile/ProfileError.h"
#include "profile/ProfileSections.h"

namespace hostsim {

namespace {

constexpr std::uint64_t mostInterfaces = 100000;
// As written: the entries of a counted interface are shared, not copied.
constexpr std::size_t mostIpv6Addresses = 100000;
std::optional<Ipv4Bytes> readDottedDecimal(JsonObjectReader &entry, const char *key) {
    const std::optional<std::string> text = entry.text(key);
    if (!text) return std::nullopt;
    Ipv4Bytes bytes{};
    if (std::strlen(text->c_str()) != text->size() || ::inet_pton(AF_INET, text->c_str(), bytes.data()) != 1) {
        entry.fail(key, "expected a dotted-decimal IPv4 address such as \"192.168.0.1\", got \"" + *text + "\"");
    }
    return bytes;
}

std::optional<Ipv4Profile> readIpv4(JsonObjectReader &entry) {
    const std::optional<Ipv4Bytes> address = readDottedDecimal(entry, "ipv4Address");
    const std::optional<Ipv4Bytes> netmask = readDottedDecimal(entry, "ipv4Netmask");
    if (!address) {
        if (netmask) entry.fail("ipv4Netmask", "given without ipv4Address");
        return std::nullopt;
    }
    return Ipv4Profile{*address, netmask.value_or(Ipv4Bytes{})};
}

void readIpv6(JsonObjectReader &entry, InterfaceProfile &interface, std::size_t &addressesRead) {
    entry.eachObject("ipv6", [&interface, &addressesRead](JsonObjectReader &element) {
        if (addressesRead == mostIpv6Addresses) {
            throw ProfileError("ipInterfaces: more than " + std::to_string(mostIpv6Addresses) + " IPv6 addresses");
        }
        Ipv6Profile address;
        address.instance = readInstanceName(element, "instance").value_or(std::to_string(interface.ipv6.size()));
        std::optional<std::string> text = element.text("address");
        if (!text) element.fail("address", "missing");
        address.address = std::move(*text);
        readNumber(element, "prefixLength", address.prefixLength);
        element.finish();
        if (!interface.ipv6Index.emplace(address.instance, interface.ipv6.size()).second) {
            element.fail("instance", "duplicate IPv6 instance \"" + address.instance + "\"");
        }
        interface.ipv6.push_back(std::move(address));
        ++addressesRead;
    });
}

}  // namespace

void readInterfaces(JsonObjectReader &host, HostProfile &profile) {
    std::size_t ipv6AddressesRead = 0;
    host.eachObject("ipInterfaces", [&profile, &ipv6AddressesRead](JsonObjectReader &entry) {
        auto interface = std::make_unique<InterfaceProfile>();
        std::optional<std::string> name = readInstanceName(entry, "name");
        if (!name) entry.fail("name", "missing");
        interface->name = std::move(*name);
        interface->ipv4 = readIpv4(entry);
        readIpv6(entry, *interface, ipv6AddressesRead);
        if (const auto count = entry.unsignedInteger("count", 1, mostInterfaces)) {
            interface->count = static_cast<std::uint32_t>(*count);
        }
        entry.finish();
        if (profile.interfaces.size() + interface->count.value_or(1) > mostInterfaces) {
            throw ProfileError("ipInterfaces: more than " + std::to_string(mostInterfaces) + " interfaces");
        }
        if (const auto taken = profile.interfaces.add(std::move(interface))) {
            entry.fail("name", "duplicate interface name \"" + *taken + "\"");
        }
    });
}

}  // namespace hostsim
