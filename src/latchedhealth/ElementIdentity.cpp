#include "latchedhealth/ElementIdentity.h"

#include <algorithm>
#include <cstring>
#include <utility>
#include <vector>

#include "CmpiStatus.h"
#include "CmpiString.h"

namespace TvLatchedHealth {

namespace {

using KeyPairs = std::vector<std::pair<std::string, std::string>>;

std::string lowerAscii(std::string text) {
    for (char &c : text) {
        if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
    }
    return text;
}

// Each field carries its length, so no text can pass for a separator.
void appendField(std::string &identity, const std::string &field) {
    identity += std::to_string(field.size());
    identity += ':';
    identity += field;
}

std::string fold(const std::string &className, const std::string &nameSpace,
                 const std::optional<std::string> &host, KeyPairs keys) {
    for (auto &key : keys) key.first = lowerAscii(key.first);
    std::sort(keys.begin(), keys.end());
    std::string identity;
    appendField(identity, className);
    appendField(identity, nameSpace);
    identity += host ? 'h' : '-';
    if (host) appendField(identity, *host);
    for (const auto &[name, value] : keys) {
        appendField(identity, name);
        appendField(identity, value);
    }
    return identity;
}

std::string textOf(const CmpiString &text) { return text.isNull() ? std::string() : text.charPtr(); }

}  // namespace

std::optional<std::string> elementIdentity(const CmpiObjectPath &element) {
    CmpiString host;
    try {
        host = element.getHostname();
    } catch (const CmpiStatus &) {
        return std::nullopt;  // a record could not say which host it names
    }
    KeyPairs keys;
    const unsigned int count = element.getKeyCount();
    for (unsigned int index = 0; index < count; ++index) {
        CmpiString name;
        const CmpiData value = element.getKey(index, &name);
        if (value.isNullValue() || value.isNotFound() ||
            (value.type() != CMPI_string && value.type() != CMPI_chars)) {
            return std::nullopt;
        }
        keys.emplace_back(textOf(name), textOf(CmpiString(value)));
    }
    std::optional<std::string> hostText;
    if (!host.isNull()) hostText = host.charPtr();
    return fold(textOf(element.getClassName()), textOf(element.getNameSpace()), hostText,
                std::move(keys));
}

std::string recordIdentity(const HealthInfo &record) {
    KeyPairs keys;
    for (const HealthKey &key : record.keys) keys.emplace_back(key.keyName, key.keyValue);
    std::optional<std::string> host;
    if (std::strncmp(record.hostName, "NULL", 4) != 0) host = record.hostName;
    return fold(record.className, record.nameSpace, host, std::move(keys));
}

}  // namespace TvLatchedHealth
