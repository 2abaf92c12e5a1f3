#include "model/CimValue.h"

#include <algorithm>
#include <utility>

#include "model/CimTypes.h"

namespace tvxbroker {

namespace {

CimValue makeNonNull(CMPIType type) {
    CimValue v;
    v.type = type;
    v.null = false;
    return v;
}

bool sameScalar(const CimValue &a, const CimValue &b) {
    switch (valueKind(a.type)) {
    case ValueKind::Boolean:
        return a.boolean == b.boolean;
    case ValueKind::Unsigned:
        return a.unsignedValue == b.unsignedValue;
    case ValueKind::Signed:
        return a.signedValue == b.signedValue;
    case ValueKind::Real:
        return a.real == b.real;
    case ValueKind::Text:
        return a.text == b.text;
    case ValueKind::DateTime:
        return a.dateTime == b.dateTime;
    case ValueKind::Reference:
        return a.reference && b.reference ? *a.reference == *b.reference : a.reference == b.reference;
    case ValueKind::Instance:
        return a.instance && b.instance ? *a.instance == *b.instance : a.instance == b.instance;
    case ValueKind::None:
        break;
    }
    return true;
}

const CimValue *findNamed(const std::vector<NamedValue> &values, const std::string &name) {
    for (const NamedValue &v : values) {
        if (equalsIgnoreCase(v.name, name)) return &v.value;
    }
    return nullptr;
}

bool allFoundIn(const std::vector<NamedValue> &values, const std::vector<NamedValue> &in) {
    for (const NamedValue &v : values) {
        const CimValue *other = findNamed(in, v.name);
        if (!other || *other != v.value) return false;
    }
    return true;
}

// CIM names are case-insensitive and carry no order, so neither may decide equality.
bool sameNamedValues(const std::vector<NamedValue> &a, const std::vector<NamedValue> &b) {
    return a.size() == b.size() && allFoundIn(a, b) && allFoundIn(b, a);
}

char lowerAscii(char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; }

}  // namespace

CimValue CimValue::makeString(std::string s) {
    CimValue v = makeNonNull(CMPI_string);
    v.text = std::move(s);
    return v;
}

CimValue CimValue::makeBoolean(bool b) {
    CimValue v = makeNonNull(CMPI_boolean);
    v.boolean = b;
    return v;
}

CimValue CimValue::makeUnsigned(CMPIType type, std::uint64_t u) {
    CimValue v = makeNonNull(type);
    v.unsignedValue = u;
    return v;
}

CimValue CimValue::makeSigned(CMPIType type, std::int64_t s) {
    CimValue v = makeNonNull(type);
    v.signedValue = s;
    return v;
}

CimValue CimValue::makeReal(CMPIType type, double r) {
    CimValue v = makeNonNull(type);
    v.real = r;
    return v;
}

CimValue CimValue::makeDateTime(DateTime d) {
    CimValue v = makeNonNull(CMPI_dateTime);
    v.dateTime = d;
    return v;
}

CimValue CimValue::makeReference(ObjectPath path) {
    CimValue v = makeNonNull(CMPI_ref);
    v.reference = std::make_shared<const ObjectPath>(std::move(path));
    return v;
}

CimValue CimValue::makeInstance(Instance instance) {
    CimValue v = makeNonNull(CMPI_instance);
    v.instance = std::make_shared<const Instance>(std::move(instance));
    return v;
}

CimValue CimValue::makeArray(CMPIType elementType, std::vector<CimValue> elements) {
    CimValue v = makeNonNull(elementType | CMPI_ARRAY);
    v.elements = std::move(elements);
    return v;
}

CimValue CimValue::makeNull(CMPIType type) {
    CimValue v;
    v.type = type;
    return v;
}

bool operator==(const DateTime &a, const DateTime &b) {
    return a.microseconds == b.microseconds && a.interval == b.interval;
}

bool operator==(const CimValue &a, const CimValue &b) {
    if (a.type != b.type || a.null != b.null) return false;
    if (a.null) return true;
    if (a.isArray()) return a.elements == b.elements;
    return sameScalar(a, b);
}

const CimValue *ObjectPath::key(const std::string &name) const { return findNamed(keys, name); }

bool operator==(const ObjectPath &a, const ObjectPath &b) {
    return equalsIgnoreCase(a.host, b.host) && equalsIgnoreCase(a.nameSpace, b.nameSpace) &&
           equalsIgnoreCase(a.className, b.className) && sameNamedValues(a.keys, b.keys);
}

const CimValue *Instance::property(const std::string &name) const { return findNamed(properties, name); }

bool operator==(const Instance &a, const Instance &b) {
    return a.path == b.path && sameNamedValues(a.properties, b.properties);
}

bool equalsIgnoreCase(const std::string &a, const std::string &b) {
    if (a.size() != b.size()) return false;
    for (std::size_t i = 0; i < a.size(); ++i) {
        if (lowerAscii(a[i]) != lowerAscii(b[i])) return false;
    }
    return true;
}

bool isCimName(const std::string &s) {
    const auto letter = [](char c) { return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || c == '_'; };
    const auto digit = [](char c) { return c >= '0' && c <= '9'; };
    return !s.empty() && letter(s[0]) &&
           std::all_of(s.begin(), s.end(), [&](char c) { return letter(c) || digit(c); });
}

std::string toLowerAscii(std::string s) {
    for (char &c : s) c = lowerAscii(c);
    return s;
}

}  // namespace tvxbroker
