// A fault a profile injects: which platform call fails, and when.
#pragma once

#include <cstdint>
#include <optional>
#include <string>

#include "hostsim/HostSimControl.h"

namespace hostsim {

enum class Operation {
    CheckSig,
    GetInstanceListAlloc,
    Get,
    ParamListCreate,
    ParamListAddString,
    ParamListAddInt,
    ParamListGetString,
    ParamListGetInt32,
    ParamListGetParam,
    GetSystemVersion,
};

// One platform call as fault rules see it. `number` is the node, index or
// added value and `text` the instance (last parameter, integers in decimal)
// or added string, whichever the operation has.
struct Call {
    Operation operation;
    std::optional<std::int64_t> number;
    std::optional<std::string> text;
};

struct FaultRule {
    Operation operation;
    std::optional<std::int64_t> number;  // absent: any
    std::optional<std::string> text;     // absent: any
    std::uint64_t nth = 0;               // fail only the nth matching call; 0: every one
    bool noList = false;                 // instance list: succeed without handing out a list
    int status = HOSTSIM_STATUS_INJECTED;  // what a failed version query returns

    bool matches(const Call &call) const {
        return operation == call.operation && (!number || number == call.number) &&
               (!text || text == call.text);
    }
};

}  // namespace hostsim
