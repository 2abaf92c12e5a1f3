// Reads one JSON object of a profile field by field. Every error names the
// field by its path ("adapters[1].mtu"), and finish() rejects the fields that
// nobody asked for, so a misspelt field is an error rather than a default.
#pragma once

#include <cstdint>
#include <functional>
#include <limits>
#include <optional>
#include <set>
#include <string>

#include <nlohmann/json.hpp>

namespace hostsim {

// What a wrong value was, short enough for a one-line message.
std::string describeJson(const nlohmann::json &value);

class JsonObjectReader {
public:
    // `path` is the object's own path, empty for the top level.
    JsonObjectReader(const nlohmann::json &object, std::string path);

    // Each getter returns nothing when the field is absent and throws
    // ProfileError when it has the wrong type or range.
    std::optional<std::string> text(const char *key);
    // A text, or an integer taken as its decimal text.
    std::optional<std::string> textOrInteger(const char *key);
    // An integer, or hexadecimal text such as "0x8086".
    std::optional<std::uint64_t> unsignedInteger(const char *key, std::uint64_t min, std::uint64_t max);
    std::optional<std::int64_t> signedInteger(const char *key,
                                              std::int64_t min = std::numeric_limits<std::int64_t>::min(),
                                              std::int64_t max = std::numeric_limits<std::int64_t>::max());
    std::optional<bool> boolean(const char *key);
    // true, false, or a value from 0 to `max` (false is 0, true is 1).
    std::optional<std::uint64_t> flag(const char *key, std::uint64_t max = 255);
    // True when the field is present and JSON null.
    bool isNull(const char *key);
    // Reads the object `key` (absent: not at all, and returns false) with
    // the path "key".
    bool object(const char *key, const std::function<void(JsonObjectReader &object)> &read);
    // Reads each element of the array `key` (absent: none) as an object
    // whose path is "key[i]".
    void eachObject(const char *key, const std::function<void(JsonObjectReader &element)> &read);
    // The same for elements of any JSON type, each with its path.
    void eachValue(const char *key,
                   const std::function<void(const nlohmann::json &element, const std::string &path)> &read);
    // The field whatever its JSON type, for a caller that tells the types
    // apart itself; null when absent.
    const nlohmann::json *anyValue(const char *key);

    [[noreturn]] void fail(const char *key, const std::string &problem) const;
    std::string fieldPath(const char *key) const;
    void finish() const;

private:
    const nlohmann::json *field(const char *key);

    const nlohmann::json &object_;
    std::string path_;
    std::set<std::string> read_;
};

}  // namespace hostsim
