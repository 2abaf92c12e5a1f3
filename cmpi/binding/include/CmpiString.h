// A CIM string. It keeps its own copy of the text, so it stays valid after
// the broker has released the object it came from; a null string (no value)
// has a null character pointer.
#pragma once

#include <optional>
#include <string>

#include "cmpi/cmpift.h"

class CmpiString {
public:
    CmpiString() = default;
    CmpiString(const char *text);  // NOLINT: null gives the null string
    CmpiString(const std::string &text);  // NOLINT
    explicit CmpiString(const CMPIString *handle);

    const char *charPtr() const { return text ? text->c_str() : nullptr; }
    bool isNull() const { return !text.has_value(); }
    bool equals(const char *other) const;
    bool equals(const CmpiString &other) const { return equals(other.charPtr()); }
    bool equalsIgnoreCase(const char *other) const;
    bool equalsIgnoreCase(const CmpiString &other) const {
        return equalsIgnoreCase(other.charPtr());
    }

private:
    std::optional<std::string> text;
};
