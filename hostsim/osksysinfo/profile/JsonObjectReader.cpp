#include "profile/JsonObjectReader.h"

#include <cctype>
#include <limits>
#include <utility>

#include "profile/ProfileError.h"

namespace hostsim {

namespace {

std::optional<std::uint64_t> parseHex(const std::string &text) {
    if (text.size() < 3 || text[0] != '0' || (text[1] != 'x' && text[1] != 'X')) return std::nullopt;
    std::uint64_t value = 0;
    for (std::size_t i = 2; i < text.size(); ++i) {
        const unsigned char c = static_cast<unsigned char>(text[i]);
        if (!std::isxdigit(c) || value > std::numeric_limits<std::uint64_t>::max() / 16) return std::nullopt;
        const int digit = std::isdigit(c) ? c - '0' : std::tolower(c) - 'a' + 10;
        value = value * 16 + static_cast<std::uint64_t>(digit);
    }
    return value;
}

// A JSON integer of zero or more, or hexadecimal text.
std::optional<std::uint64_t> unsignedValue(const nlohmann::json &value) {
    if (value.is_number_unsigned()) return value.get<std::uint64_t>();
    if (value.is_string()) return parseHex(value.get<std::string>());
    return std::nullopt;
}

std::string rangeProblem(const std::string &min, const std::string &max, const nlohmann::json &value) {
    return "an integer from " + min + " to " + max + " (or hexadecimal text such as \"0x1f\"), got " +
           describeJson(value);
}

}  // namespace

std::string describeJson(const nlohmann::json &value) {
    if (value.is_structured()) return std::string("an ") + value.type_name();
    std::string text = value.dump();
    constexpr std::size_t longest = 40;
    if (text.size() > longest) text = text.substr(0, longest) + "...";
    return text;
}

JsonObjectReader::JsonObjectReader(const nlohmann::json &object, std::string path)
    : object_(object), path_(std::move(path)) {
    if (!object_.is_object()) {
        throw ProfileError((path_.empty() ? std::string("profile") : path_) + ": expected an object, got " +
                           describeJson(object_));
    }
}

std::string JsonObjectReader::fieldPath(const char *key) const {
    return path_.empty() ? key : path_ + "." + key;
}

void JsonObjectReader::fail(const char *key, const std::string &problem) const {
    throw ProfileError(fieldPath(key) + ": " + problem);
}

const nlohmann::json *JsonObjectReader::field(const char *key) {
    read_.insert(key);
    const auto found = object_.find(key);
    return found == object_.end() ? nullptr : &*found;
}

std::optional<std::string> JsonObjectReader::text(const char *key) {
    const nlohmann::json *value = field(key);
    if (!value) return std::nullopt;
    if (!value->is_string()) fail(key, "expected a text, got " + describeJson(*value));
    return value->get<std::string>();
}

std::optional<std::string> JsonObjectReader::textOrInteger(const char *key) {
    const nlohmann::json *value = field(key);
    if (!value) return std::nullopt;
    if (value->is_string()) return value->get<std::string>();
    if (value->is_number_unsigned()) return std::to_string(value->get<std::uint64_t>());
    if (value->is_number_integer()) return std::to_string(value->get<std::int64_t>());
    fail(key, "expected a text or an integer, got " + describeJson(*value));
}

std::optional<std::uint64_t> JsonObjectReader::unsignedInteger(const char *key, std::uint64_t min,
                                                               std::uint64_t max) {
    const nlohmann::json *value = field(key);
    if (!value) return std::nullopt;
    const std::optional<std::uint64_t> number = unsignedValue(*value);
    if (!number || *number < min || *number > max) {
        fail(key, "expected " + rangeProblem(std::to_string(min), std::to_string(max), *value));
    }
    return number;
}

std::optional<std::int64_t> JsonObjectReader::signedInteger(const char *key, std::int64_t min, std::int64_t max) {
    const nlohmann::json *value = field(key);
    if (!value) return std::nullopt;
    std::optional<std::int64_t> number;
    const std::optional<std::uint64_t> unsignedNumber = unsignedValue(*value);
    if (value->is_number_integer() && !value->is_number_unsigned()) {
        number = value->get<std::int64_t>();
    } else if (unsignedNumber && *unsignedNumber <= std::uint64_t(std::numeric_limits<std::int64_t>::max())) {
        number = std::int64_t(*unsignedNumber);
    }
    if (!number || *number < min || *number > max) {
        fail(key, "expected " + rangeProblem(std::to_string(min), std::to_string(max), *value));
    }
    return number;
}

std::optional<bool> JsonObjectReader::boolean(const char *key) {
    const nlohmann::json *value = field(key);
    if (!value) return std::nullopt;
    if (!value->is_boolean()) fail(key, "expected true or false, got " + describeJson(*value));
    return value->get<bool>();
}

std::optional<std::uint64_t> JsonObjectReader::flag(const char *key, std::uint64_t max) {
    const nlohmann::json *value = field(key);
    if (!value) return std::nullopt;
    if (value->is_boolean()) return value->get<bool>() ? 1 : 0;
    const std::optional<std::uint64_t> number = unsignedValue(*value);
    if (!number || *number > max) {
        fail(key, "expected true, false or " + rangeProblem("0", std::to_string(max), *value));
    }
    return number;
}

bool JsonObjectReader::isNull(const char *key) {
    const nlohmann::json *value = field(key);
    return value != nullptr && value->is_null();
}

bool JsonObjectReader::object(const char *key, const std::function<void(JsonObjectReader &object)> &read) {
    const nlohmann::json *value = field(key);
    if (!value) return false;
    JsonObjectReader reader(*value, fieldPath(key));
    read(reader);
    return true;
}

void JsonObjectReader::eachObject(const char *key, const std::function<void(JsonObjectReader &element)> &read) {
    eachValue(key, [&read](const nlohmann::json &value, const std::string &path) {
        JsonObjectReader element(value, path);
        read(element);
    });
}

void JsonObjectReader::eachValue(
    const char *key, const std::function<void(const nlohmann::json &element, const std::string &path)> &read) {
    const nlohmann::json *value = field(key);
    if (!value) return;
    if (!value->is_array()) fail(key, "expected an array, got " + describeJson(*value));
    for (std::size_t i = 0; i < value->size(); ++i) read((*value)[i], fieldPath(key) + "[" + std::to_string(i) + "]");
}

const nlohmann::json *JsonObjectReader::anyValue(const char *key) {
    return field(key);
}

void JsonObjectReader::finish() const {
    for (const auto &item : object_.items()) {
        if (read_.count(item.key()) == 0) fail(item.key().c_str(), "unknown field");
    }
}

}  // namespace hostsim
