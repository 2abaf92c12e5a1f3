// "watchedElements": the elements of the watched hardware classes, each with
// the object path it is served on and its HealthState poll by poll. A value
// of another type than the property's is served as written, so a profile can
// script what a wrong provider answers.
#include <limits>
#include <set>
#include <string>
#include <utility>

#include "profile/ProfileError.h"
#include "profile/ProfileSections.h"

namespace hostsim {

namespace {

constexpr std::size_t mostElements = 100000;
// Each, over the whole section, as written.
constexpr std::size_t mostKeys = 100000;
constexpr std::size_t mostHealthStates = 100000;
// Class, namespace, host and key names and every text value.
constexpr std::size_t longestText = 255;
constexpr std::uint64_t largestHealthState = std::numeric_limits<std::uint16_t>::max();
// Written in place of a HealthState, it leaves the property unset.
const char *const missingWord = "missing";

[[noreturn]] void refuse(const std::string &path, const std::string &problem) {
    throw ProfileError(path + ": " + problem);
}

// A text a CMPI string can carry whole: bounded, and without NUL.
std::string boundedText(const nlohmann::json &value, const std::string &path) {
    std::string text = value.get<std::string>();
    if (text.size() > longestText || text.find('\0') != std::string::npos) {
        refuse(path, "expected a text of at most " + std::to_string(longestText) + " bytes without NUL, got " +
                         describeJson(value));
    }
    return text;
}

std::optional<std::string> readText(JsonObjectReader &entry, const char *key) {
    const nlohmann::json *value = entry.anyValue(key);
    if (value == nullptr) return std::nullopt;
    if (!value->is_string()) entry.fail(key, "expected a text, got " + describeJson(*value));
    return boundedText(*value, entry.fieldPath(key));
}

std::string readName(JsonObjectReader &entry, const char *key) {
    std::optional<std::string> name = readText(entry, key);
    if (!name) entry.fail(key, "missing");
    if (name->empty()) entry.fail(key, "expected a text that is not empty");
    return std::move(*name);
}

// An integer is served as sint64, or as uint64 beyond that.
ScriptedValue integerValue(const nlohmann::json &value) {
    ScriptedValue scripted;
    if (value.is_number_unsigned() &&
        value.get<std::uint64_t>() > std::uint64_t(std::numeric_limits<std::int64_t>::max())) {
        scripted.type = HOSTSIM_VALUE_UINT64;
        scripted.unsignedValue = value.get<std::uint64_t>();
    } else {
        scripted.type = HOSTSIM_VALUE_SINT64;
        scripted.signedValue = value.get<std::int64_t>();
    }
    return scripted;
}

ScriptedValue booleanValue(const nlohmann::json &value) {
    ScriptedValue scripted;
    scripted.type = HOSTSIM_VALUE_BOOLEAN;
    scripted.unsignedValue = value.get<bool>() ? 1 : 0;
    return scripted;
}

ScriptedValue textValue(const nlohmann::json &value, const std::string &path) {
    ScriptedValue scripted;
    scripted.type = HOSTSIM_VALUE_STRING;
    scripted.text = boundedText(value, path);
    return scripted;
}

// 0 to 65535 is a HealthState; null sets it null, "missing" leaves it unset;
// any other text, integer or boolean is served with its own type.
ScriptedValue healthState(const nlohmann::json &value, const std::string &path) {
    if (value.is_number_unsigned() && value.get<std::uint64_t>() <= largestHealthState) {
        ScriptedValue scripted;
        scripted.type = HOSTSIM_VALUE_UINT16;
        scripted.unsignedValue = value.get<std::uint64_t>();
        return scripted;
    }
    if (value.is_null()) {
        ScriptedValue scripted;
        scripted.type = HOSTSIM_VALUE_NULL;
        return scripted;
    }
    if (value.is_string() && value.get<std::string>() == missingWord) return ScriptedValue{};
    if (value.is_string()) return textValue(value, path);
    if (value.is_number_integer()) return integerValue(value);
    if (value.is_boolean()) return booleanValue(value);
    refuse(path, std::string("expected an integer, null, \"") + missingWord + "\", a text, true or false, got " +
                     describeJson(value));
}

// A text is a string key; an integer is uint64 from 0 up and sint64 below.
ScriptedValue keyValue(const nlohmann::json &value, const std::string &path) {
    if (value.is_string()) return textValue(value, path);
    if (value.is_boolean()) return booleanValue(value);
    if (value.is_number_unsigned()) {
        ScriptedValue scripted;
        scripted.type = HOSTSIM_VALUE_UINT64;
        scripted.unsignedValue = value.get<std::uint64_t>();
        return scripted;
    }
    if (value.is_number_integer()) return integerValue(value);
    refuse(path, "expected a text, an integer, true or false, got " + describeJson(value));
}

void readKeys(JsonObjectReader &entry, std::vector<WatchedKey> &keys, std::size_t &keysRead) {
    std::set<std::string> names;  // caseless
    entry.eachObject("keys", [&](JsonObjectReader &key) {
        if (keysRead == mostKeys) {
            throw ProfileError("watchedElements: more than " + std::to_string(mostKeys) + " keys");
        }
        WatchedKey read;
        read.name = readName(key, "name");
        const nlohmann::json *value = key.anyValue("value");
        if (value == nullptr) key.fail("value", "missing");
        read.value = keyValue(*value, key.fieldPath("value"));
        key.finish();
        if (!names.insert(caselessName(read.name)).second) key.fail("name", "duplicate key \"" + read.name + "\"");
        keys.push_back(std::move(read));
        ++keysRead;
    });
}

void readHealthStates(JsonObjectReader &entry, std::vector<ScriptedValue> &states, std::size_t &statesRead) {
    entry.eachValue("healthStates", [&](const nlohmann::json &value, const std::string &path) {
        if (statesRead == mostHealthStates) {
            throw ProfileError("watchedElements: more than " + std::to_string(mostHealthStates) + " health states");
        }
        states.push_back(healthState(value, path));
        ++statesRead;
    });
}

}  // namespace

void readWatchedElements(JsonObjectReader &host, HostProfile &profile) {
    std::size_t keysRead = 0;
    std::size_t statesRead = 0;
    host.eachObject("watchedElements", [&](JsonObjectReader &entry) {
        if (profile.watchedElements.size() == mostElements) {
            throw ProfileError("watchedElements: more than " + std::to_string(mostElements) + " elements");
        }
        WatchedElementProfile element;
        element.className = readName(entry, "class");
        if (entry.anyValue("namespace") != nullptr) element.nameSpace = readName(entry, "namespace");
        element.hostName = readText(entry, "hostName");
        readKeys(entry, element.keys, keysRead);
        readHealthStates(entry, element.healthStates, statesRead);
        entry.finish();
        profile.watchedElements.add(std::move(element));
    });
}

}  // namespace hostsim
