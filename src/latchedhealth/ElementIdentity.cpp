#include "latchedhealth/ElementIdentity.h"

#include <cstring>
#include <utility>
#include <vector>

#include "CmpiStatus.h"
#include "CmpiString.h"
#include "platform/TextKeys.h"

namespace TvLatchedHealth {

namespace {

// Each field carries its length, so no text can pass for a separator.
void appendField(std::string &identity, const std::string &field) {
    identity += std::to_string(field.size());
    identity += ':';
    identity += field;
}

std::string fold(const std::string &className, const std::string &nameSpace,
                 const std::optional<std::string> &host, const platform::TextKeyList &keys) {
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
    const std::optional<platform::TextKeyList> keys = platform::textKeysOf(element, true);
    if (!keys) return std::nullopt;
    std::optional<std::string> hostText;
    if (!host.isNull()) hostText = host.charPtr();
    return fold(textOf(element.getClassName()), textOf(element.getNameSpace()), hostText, *keys);
}

std::string recordIdentity(const HealthInfo &record) {
    platform::TextKeyList keys;
    for (const HealthKey &key : record.keys) keys.emplace_back(key.keyName, key.keyValue);
    std::optional<std::string> host;
    if (std::strncmp(record.hostName, "NULL", 4) != 0) host = record.hostName;
    return fold(record.className, record.nameSpace, host, platform::normalizedKeys(std::move(keys)));
}

}  // namespace TvLatchedHealth
