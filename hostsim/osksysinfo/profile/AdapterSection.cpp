// "adapters": the physical network adapters, in instance-list order. An entry
// with "count" N stands for N adapters named <name>0 ... <name>N-1, so a
// large host is a few lines of JSON.
#include <limits>
#include <string>

#include "profile/ProfileError.h"
#include "profile/ProfileSections.h"

namespace hostsim {

namespace {

constexpr std::uint64_t mostAdapters = 100000;
constexpr std::uint64_t max16 = std::numeric_limits<std::uint16_t>::max();
constexpr std::uint64_t max32 = std::numeric_limits<std::uint32_t>::max();

template <typename Number>
void readNumber(JsonObjectReader &entry, const char *key, std::uint64_t max, Number &into) {
    if (const auto value = entry.unsignedInteger(key, 0, max)) into = static_cast<Number>(*value);
}

void readText(JsonObjectReader &entry, const char *key, std::string &into) {
    if (auto value = entry.text(key)) into = std::move(*value);
}

AdapterProfile readAdapter(JsonObjectReader &entry) {
    AdapterProfile adapter;
    auto name = entry.text("name");
    if (!name) entry.fail("name", "missing");
    adapter.name = std::move(*name);
    readText(entry, "driverName", adapter.driverName);
    readText(entry, "driverVersion", adapter.driverVersion);
    readText(entry, "firmwareVersion", adapter.firmwareVersion);
    readText(entry, "interfaceName", adapter.interfaceName);
    readNumber(entry, "capabilities", max32, adapter.capabilities);
    readNumber(entry, "enabledCapabilities", max32, adapter.enabledCapabilities);
    readNumber(entry, "pciBus", max32, adapter.pciBus);
    readNumber(entry, "pciSlot", max32, adapter.pciSlot);
    readNumber(entry, "pciFunction", max32, adapter.pciFunction);
    readNumber(entry, "pciVendorId", max16, adapter.pciVendorId);
    readNumber(entry, "pciDeviceId", max16, adapter.pciDeviceId);
    adapter.linkUp = entry.flag("linkUp").value_or(adapter.linkUp);
    readNumber(entry, "speedMbps", max16, adapter.speedMbps);
    adapter.fullDuplex = entry.flag("fullDuplex").value_or(adapter.fullDuplex);
    readText(entry, "mac", adapter.mac);
    readNumber(entry, "mtu", max32, adapter.mtu);
    return adapter;
}

void add(HostProfile &profile, AdapterProfile adapter, JsonObjectReader &entry) {
    if (profile.adapters.size() == mostAdapters) {
        throw ProfileError("adapters: more than " + std::to_string(mostAdapters) + " adapters");
    }
    if (!profile.adapterIndex.emplace(adapter.name, profile.adapters.size()).second) {
        entry.fail("name", "duplicate adapter name \"" + adapter.name + "\"");
    }
    profile.adapters.push_back(std::move(adapter));
}

}  // namespace

void readAdapters(JsonObjectReader &host, HostProfile &profile) {
    host.eachObject("adapters", [&profile](JsonObjectReader &entry) {
        const AdapterProfile adapter = readAdapter(entry);
        const std::optional<std::uint64_t> count = entry.unsignedInteger("count", 1, mostAdapters);
        entry.finish();
        if (!count) {
            add(profile, adapter, entry);
            return;
        }
        for (std::uint64_t n = 0; n < *count; ++n) {
            AdapterProfile copy = adapter;
            copy.name += std::to_string(n);
            add(profile, std::move(copy), entry);
        }
    });
}

}  // namespace hostsim
