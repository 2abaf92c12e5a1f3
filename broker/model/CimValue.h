// Plain CIM values as the embedded broker keeps them, independent of any
// CMPI handle: what providers hand over through the C ABI is copied into
// these, so results outlive the request objects that carried them.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "cmpi/cmpidt.h"

namespace tvxbroker {

struct ObjectPath;
struct Instance;

struct DateTime {
    std::uint64_t microseconds = 0;  // since the epoch, or the length of an interval
    bool interval = false;
};

bool operator==(const DateTime &a, const DateTime &b);

// One value of any CMPI type. Only the member that the type selects is
// meaningful; arrays keep their elements (each of the element type) in
// `elements`.
struct CimValue {
    CMPIType type = CMPI_null;
    bool null = true;
    bool boolean = false;
    std::uint64_t unsignedValue = 0;  // uint8..uint64 and char16
    std::int64_t signedValue = 0;     // sint8..sint64
    double real = 0;                  // real32, real64
    std::string text;                 // string, chars
    DateTime dateTime;
    std::shared_ptr<const ObjectPath> reference;
    std::shared_ptr<const Instance> instance;
    std::vector<CimValue> elements;

    bool isArray() const { return (type & CMPI_ARRAY) != 0; }
    CMPIType elementType() const { return static_cast<CMPIType>(type & ~CMPI_ARRAY); }

    static CimValue makeString(std::string s);
    static CimValue makeBoolean(bool b);
    static CimValue makeUnsigned(CMPIType type, std::uint64_t v);
    static CimValue makeSigned(CMPIType type, std::int64_t v);
    static CimValue makeReal(CMPIType type, double v);
    static CimValue makeDateTime(DateTime v);
    static CimValue makeReference(ObjectPath path);
    static CimValue makeInstance(Instance instance);
    static CimValue makeArray(CMPIType elementType, std::vector<CimValue> elements);
    static CimValue makeNull(CMPIType type);
};

bool operator==(const CimValue &a, const CimValue &b);
inline bool operator!=(const CimValue &a, const CimValue &b) { return !(a == b); }

struct NamedValue {
    std::string name;
    CimValue value;
};

struct ObjectPath {
    std::string host;
    std::string nameSpace;
    std::string className;
    std::vector<NamedValue> keys;  // in the order they were added

    const CimValue *key(const std::string &name) const;  // case-insensitive
};

bool operator==(const ObjectPath &a, const ObjectPath &b);
inline bool operator!=(const ObjectPath &a, const ObjectPath &b) { return !(a == b); }

struct Instance {
    ObjectPath path;
    std::vector<NamedValue> properties;  // in the order they were first set

    const CimValue *property(const std::string &name) const;  // case-insensitive
};

bool operator==(const Instance &a, const Instance &b);
inline bool operator!=(const Instance &a, const Instance &b) { return !(a == b); }

bool equalsIgnoreCase(const std::string &a, const std::string &b);
std::string toLowerAscii(std::string s);
bool isCimName(const std::string &s);  // letters, digits and '_', not starting with a digit

}  // namespace tvxbroker
