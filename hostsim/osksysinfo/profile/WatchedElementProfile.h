// The elements of the watched hardware classes that the stand-in host
// providers serve: each one's object path and its HealthState, one per poll.
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <unordered_map>
#include <vector>

#include "hostsim/HostSimControl.h"

namespace hostsim {

// CIM names compare without case, which only ASCII letters have there.
inline std::string caselessName(std::string name) {
    for (char &c : name) {
        if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
    }
    return name;
}

// A key value or a HealthState with the CIM type it is served as.
struct ScriptedValue {
    HostSimValueType type = HOSTSIM_VALUE_MISSING;
    std::uint64_t unsignedValue = 0;  // UINT16 and UINT64; BOOLEAN as 0 or 1
    std::int64_t signedValue = 0;     // SINT64
    std::string text;                 // STRING
};

struct WatchedKey {
    std::string name;
    ScriptedValue value;
};

struct WatchedElementProfile {
    std::string className;
    std::string nameSpace = "root/cimv2";
    std::optional<std::string> hostName;  // none: the path names no host
    std::vector<WatchedKey> keys;         // in path order
    // One per poll; polls past the last serve the last. None: "missing".
    std::vector<ScriptedValue> healthStates;

    const ScriptedValue &healthStateOfPoll(std::uint64_t poll) const {
        static const ScriptedValue missing;
        if (healthStates.empty()) return missing;
        return healthStates[poll < healthStates.size() ? std::size_t(poll) : healthStates.size() - 1];
    }
};

// The elements grouped by class, found by class name in constant time,
// letter case aside. Each class has a number, its position among the
// classes, by which the served profile counts its enumerations.
class WatchedElementTable {
public:
    void add(WatchedElementProfile element);

    // The number of the class, or none when no element has it.
    std::optional<std::size_t> findClass(const std::string &className) const;
    const std::vector<WatchedElementProfile> &elementsOf(std::size_t classNumber) const {
        return classes_[classNumber];
    }

    std::size_t classCount() const { return classes_.size(); }
    std::size_t size() const { return size_; }

private:
    std::vector<std::vector<WatchedElementProfile>> classes_;  // in order of first appearance
    std::unordered_map<std::string, std::size_t> classIndex_;  // lower-cased name -> class number
    std::size_t size_ = 0;
};

}  // namespace hostsim
