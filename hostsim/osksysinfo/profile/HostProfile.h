// The simulated host a profile describes.
#pragma once

#include <cstddef>
#include <string>
#include <unordered_map>
#include <vector>

#include "profile/AdapterProfile.h"
#include "profile/FaultRule.h"
#include "profile/InterfaceTable.h"
#include "profile/ProcessorProfile.h"
#include "profile/SystemVersionProfile.h"
#include "profile/WatchedElementProfile.h"

namespace hostsim {

struct HostProfile {
    std::string hostName = "localhost";
    bool serviceConsole = false;  // a "Corla" host; a "Corlai" host has none
    std::vector<AdapterProfile> adapters;  // in instance-list order
    std::unordered_map<std::string, std::size_t> adapterIndex;  // name -> position in adapters
    ProcessorProfile processors;
    InterfaceTable interfaces;
    SystemVersionProfile systemVersion;
    std::vector<FaultRule> faults;
    WatchedElementTable watchedElements;

    const AdapterProfile *findAdapter(const std::string &name) const {
        const auto found = adapterIndex.find(name);
        return found == adapterIndex.end() ? nullptr : &adapters[found->second];
    }
};

}  // namespace hostsim
