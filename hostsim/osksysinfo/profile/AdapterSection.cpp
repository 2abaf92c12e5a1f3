// "adapters": the physical network adapters, in instance-list order. An entry
// with "count" N stands for N adapters named <name>0 ... <name>N-1, so a
// large host is a few lines of JSON; they share the entry's texts.
#include <memory>
#include <string>

#include "profile/FieldReading.h"
#include "profile/ProfileError.h"
#include "profile/ProfileSections.h"

namespace hostsim {

namespace {

constexpr std::uint64_t mostAdapters = 100000;

AdapterProfile readAdapter(JsonObjectReader &entry) {
    AdapterProfile adapter;
    auto name = readInstanceName(entry, "name");
    if (!name) entry.fail("name", "missing");
    adapter.name = std::move(*name);
    auto texts = std::make_shared<AdapterTexts>();
    readText(entry, "driverName", texts->driverName);
    readText(entry, "driverVersion", texts->driverVersion);
    readText(entry, "firmwareVersion", texts->firmwareVersion);
    readText(entry, "interfaceName", texts->interfaceName);
    readNumber(entry, "capabilities", adapter.capabilities);
    readNumber(entry, "enabledCapabilities", adapter.enabledCapabilities);
    readNumber(entry, "pciBus", adapter.pciBus);
    readNumber(entry, "pciSlot", adapter.pciSlot);
    readNumber(entry, "pciFunction", adapter.pciFunction);
    readNumber(entry, "pciVendorId", adapter.pciVendorId);
    readNumber(entry, "pciDeviceId", adapter.pciDeviceId);
    readFlag(entry, "linkUp", adapter.linkUp);
    readNumber(entry, "speedMbps", adapter.speedMbps);
    readFlag(entry, "fullDuplex", adapter.fullDuplex);
    readText(entry, "mac", texts->mac);
    adapter.texts = std::move(texts);
    readNumber(entry, "mtu", adapter.mtu);
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
