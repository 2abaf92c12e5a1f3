// "processors": the host-wide processor settings, and the packages with
// their cores in list order. A core entry with "count" N stands for N cores
// with consecutive instance numbers, so a large host is a few lines of JSON.
// JSON null for "packages" serves a package list call that hands back none.
#include <limits>
#include <string>

#include "profile/FieldReading.h"
#include "profile/ProfileError.h"
#include "profile/ProfileSections.h"

namespace hostsim {

namespace {

constexpr std::uint64_t mostInstances = 100000;  // packages, and cores, per profile

// Absent, a number defaults to the instance's position in its list, which
// fits, as a list holds at most mostInstances.
std::optional<std::int32_t> readInstanceNumber(JsonObjectReader &entry) {
    const auto number = entry.signedInteger("instance", std::numeric_limits<std::int32_t>::min(),
                                            std::numeric_limits<std::int32_t>::max());
    if (!number) return std::nullopt;
    return static_cast<std::int32_t>(*number);
}

template <typename Instance>
void addInstance(InstanceTable<Instance> &table, const Instance &instance, JsonObjectReader &entry,
                 const char *what) {
    if (table.size() == mostInstances) {
        throw ProfileError("processors: more than " + std::to_string(mostInstances) + " " + what + "s");
    }
    if (!table.add(instance)) {
        entry.fail("instance", std::string("duplicate ") + what + " instance " + std::to_string(instance.instance));
    }
}

CpuidProfile readCpuid(JsonObjectReader &fields) {
    CpuidProfile cpuid;
    if (const auto vendor = fields.text("vendor")) {
        if (vendor->size() > cpuid.vendor.size()) {
            fields.fail("vendor", "expected a text of at most 12 bytes, got \"" + *vendor + "\"");
        }
        vendor->copy(cpuid.vendor.data(), vendor->size());
    }
    readNumber(fields, "stepping", cpuid.stepping);
    readNumber(fields, "leaf1Ebx", cpuid.leaf1Ebx);
    readNumber(fields, "leaf1Ecx", cpuid.leaf1Ecx);
    readNumber(fields, "extendedEcx", cpuid.extendedEcx);
    readNumber(fields, "extendedEdx", cpuid.extendedEdx);
    fields.finish();
    return cpuid;
}

// An entry's "cpuid" replaces `cpuid` whole; absent, `cpuid` stays.
void readCpuidField(JsonObjectReader &entry, CpuidProfile &cpuid) {
    entry.object("cpuid", [&cpuid](JsonObjectReader &fields) { cpuid = readCpuid(fields); });
}

void readCores(JsonObjectReader &package, const CpuidProfile &packageCpuid, InstanceTable<CoreProfile> &cores) {
    package.eachObject("cores", [&](JsonObjectReader &entry) {
        CoreProfile core;
        core.cpuid = packageCpuid;
        readCpuidField(entry, core.cpuid);
        readFlag(entry, "state", core.state);
        const std::optional<std::int32_t> instance = readInstanceNumber(entry);
        const std::uint64_t count = entry.unsignedInteger("count", 1, mostInstances).value_or(1);
        if (instance && count > 1) entry.fail("instance", "cannot be given with a \"count\" above 1");
        entry.finish();
        for (std::uint64_t n = 0; n < count; ++n) {
            core.instance = instance.value_or(static_cast<std::int32_t>(cores.size()));
            addInstance(cores, core, entry, "core");
        }
    });
}

void readPackages(JsonObjectReader &section, ProcessorProfile &processors) {
    section.eachObject("packages", [&processors](JsonObjectReader &entry) {
        PackageProfile package;
        package.instance = readInstanceNumber(entry).value_or(static_cast<std::int32_t>(processors.packages.size()));
        const std::size_t coresBefore = processors.cores.size();
        CpuidProfile packageCpuid;
        readCpuidField(entry, packageCpuid);
        readCores(entry, packageCpuid, processors.cores);
        package.coreCount = static_cast<std::uint32_t>(processors.cores.size() - coresBefore);
        readNumber(entry, "coreCount", package.coreCount);
        entry.finish();
        addInstance(processors.packages, package, entry, "package");
    });
}

}  // namespace

void readProcessors(JsonObjectReader &host, HostProfile &profile) {
    host.object("processors", [&profile](JsonObjectReader &section) {
        ProcessorProfile &processors = profile.processors;
        readFlag(section, "hardwareThreads", processors.hardwareThreads);
        readText(section, "modelText", processors.modelText);
        readText(section, "powerPolicy", processors.powerPolicy);
        processors.packageListServed = !section.isNull("packages");
        if (processors.packageListServed) readPackages(section, processors);
        section.finish();
    });
}

}  // namespace hostsim
