// The processors of the simulated host: the host-wide settings (nodes 605,
// 606 and 1443), the packages (node 608) and their cores (nodes 607, 799 and
// 800).
#pragma once

#include <array>
#include <cstdint>
#include <string>

#include "profile/InstanceTable.h"

namespace hostsim {

// The CPUID registers a core's node-607 record carries.
struct CpuidProfile {
    std::array<char, 12> vendor{};  // the leaf-0 vendor string, zero-padded
    std::uint8_t stepping = 0;
    std::uint32_t leaf1Ebx = 0;
    std::uint32_t leaf1Ecx = 0;
    std::uint32_t extendedEcx = 0;  // leaf 0x80000001
    std::uint32_t extendedEdx = 0;  // leaf 0x80000001
};

struct PackageProfile {
    std::int32_t instance = 0;
    // Served as given, so it may disagree with the cores the profile lists.
    std::uint32_t coreCount = 0;
};

struct CoreProfile {
    std::int32_t instance = 0;
    std::uint8_t state = 0;  // node 799; any byte value can be served
    CpuidProfile cpuid;
};

struct ProcessorProfile {
    std::uint32_t hardwareThreads = 0;
    std::string modelText;    // any text; longer than 48 bytes it is cut
    std::string powerPolicy;  // the policy name
    // False: asking for the package list succeeds without handing one out.
    bool packageListServed = true;
    InstanceTable<PackageProfile> packages;
    InstanceTable<CoreProfile> cores;  // package 0's cores first, then package 1's, ...
};

}  // namespace hostsim
