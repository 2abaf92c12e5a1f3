// "faults": platform calls the profile makes fail. Each rule names the call
// and optionally narrows it by the selectors that call has.
#include <limits>
#include <string>

#include "profile/ProfileSections.h"

namespace hostsim {

namespace {

struct CallKind {
    const char *name;
    Operation operation;
    const char *numberSelector;  // fills FaultRule::number; null: none
    const char *textSelector;    // fills FaultRule::text; null: none
};

const CallKind callKinds[] = {
    {"PRB_CheckSig", Operation::CheckSig, nullptr, nullptr},
    {"PRB_GetInstanceListAlloc", Operation::GetInstanceListAlloc, "node", "instance"},
    {"PRB_Get", Operation::Get, "node", "instance"},
    {"PRB_ParamListCreate", Operation::ParamListCreate, nullptr, nullptr},
    {"PRB_ParamListAddString", Operation::ParamListAddString, nullptr, "text"},
    {"PRB_ParamListAddInt", Operation::ParamListAddInt, "value", nullptr},
    {"PRB_ParamListGetString", Operation::ParamListGetString, "index", nullptr},
    {"PRB_ParamListGetInt32", Operation::ParamListGetInt32, "index", nullptr},
    {"PRB_ParamListGetParam", Operation::ParamListGetParam, "index", nullptr},
    {"OskuserVersion_GetSystemVersion", Operation::GetSystemVersion, nullptr, nullptr},
};

const CallKind &readCallKind(JsonObjectReader &entry) {
    const std::optional<std::string> name = entry.text("call");
    if (!name) entry.fail("call", "missing");
    for (const CallKind &kind : callKinds) {
        if (*name == kind.name) return kind;
    }
    std::string known;
    for (const CallKind &kind : callKinds) known += std::string(known.empty() ? "" : ", ") + kind.name;
    entry.fail("call", "unknown call \"" + *name + "\" (known: " + known + ")");
}

FaultRule readRule(JsonObjectReader &entry) {
    const CallKind &kind = readCallKind(entry);
    FaultRule rule{kind.operation, std::nullopt, std::nullopt};
    if (kind.numberSelector) rule.number = entry.signedInteger(kind.numberSelector);
    if (kind.textSelector) rule.text = entry.textOrInteger(kind.textSelector);
    rule.nth = entry.unsignedInteger("nth", 1, std::numeric_limits<std::uint64_t>::max()).value_or(0);
    if (kind.operation == Operation::GetInstanceListAlloc) rule.noList = entry.boolean("noList").value_or(false);
    if (kind.operation == Operation::GetSystemVersion) {
        rule.status = static_cast<int>(
            entry.signedInteger("status", 1, std::numeric_limits<std::int32_t>::max()).value_or(rule.status));
    }
    entry.finish();
    return rule;
}

}  // namespace

void readFaults(JsonObjectReader &host, HostProfile &profile) {
    host.eachObject("faults", [&profile](JsonObjectReader &entry) { profile.faults.push_back(readRule(entry)); });
}

}  // namespace hostsim
