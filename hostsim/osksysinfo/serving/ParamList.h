// What the opaque parameter-list types of the system-information library are
// in the stand-in.
#pragma once

#include <cstdint>
#include <deque>
#include <string>
#include <variant>

struct PRB_Param {
    std::variant<std::string, std::int64_t> value;
};

// A deque, so entry addresses handed out stay valid while entries are added.
struct PRB_ParamList {
    std::deque<PRB_Param> entries;
};
