#include "platform/OmcObjectIdentity.h"

#include <cstdint>
#include <cstring>
#include <optional>

#include "CmpiDateTime.h"
#include "CmpiStatus.h"

namespace OMC {

namespace {

bool isText(CMPIType type) { return type == CMPI_string || type == CMPI_chars; }

// An integer as sign and magnitude, so that every CMPI width compares.
struct Integer {
    bool negative;
    std::uint64_t magnitude;

    bool operator==(const Integer &other) const {
        return negative == other.negative && magnitude == other.magnitude;
    }
};

Integer fromSigned(std::int64_t value) {
    if (value >= 0) return {false, static_cast<std::uint64_t>(value)};
    return {true, static_cast<std::uint64_t>(-(value + 1)) + 1};
}

std::optional<Integer> integerOf(const CmpiData &data) {
    const CMPIValue &value = data.getEnc().value;
    switch (data.type()) {
    case CMPI_uint8: return Integer{false, value.uint8};
    case CMPI_uint16: return Integer{false, value.uint16};
    case CMPI_uint32: return Integer{false, value.uint32};
    case CMPI_uint64: return Integer{false, value.uint64};
    case CMPI_sint8: return fromSigned(value.sint8);
    case CMPI_sint16: return fromSigned(value.sint16);
    case CMPI_sint32: return fromSigned(value.sint32);
    case CMPI_sint64: return fromSigned(value.sint64);
    default: return std::nullopt;
    }
}

bool sameText(const char *a, const char *b) {
    return a != nullptr && b != nullptr ? std::strcmp(a, b) == 0 : a == b;
}

// Values of the same non-integer type.
bool sameScalar(const CmpiData &a, const CmpiData &b) {
    const CMPIValue &x = a.getEnc().value;
    const CMPIValue &y = b.getEnc().value;
    switch (a.type()) {
    case CMPI_boolean: return (x.boolean != 0) == (y.boolean != 0);
    case CMPI_char16: return x.char16 == y.char16;
    case CMPI_real32: return x.real32 == y.real32;
    case CMPI_real64: return x.real64 == y.real64;
    case CMPI_dateTime: {
        const CmpiDateTime first = a;
        const CmpiDateTime second = b;
        return first.getDateTime() == second.getDateTime() &&
               first.isInterval() == second.isInterval();
    }
    default: return false;  // arrays and embedded objects are never keys
    }
}

bool sameKeyValue(const CmpiData &a, const CmpiData &b) {
    if (a.isNotFound() || b.isNotFound()) return false;
    if (a.isNullValue() || b.isNullValue()) return a.isNullValue() && b.isNullValue();
    if (isText(a.type()) && isText(b.type())) {
        return sameText(static_cast<const char *>(a), static_cast<const char *>(b));
    }
    if (a.type() == CMPI_ref && b.type() == CMPI_ref) {
        return sameObject(static_cast<CmpiObjectPath>(a), static_cast<CmpiObjectPath>(b));
    }
    const std::optional<Integer> x = integerOf(a);
    const std::optional<Integer> y = integerOf(b);
    if (x || y) return x && y && *x == *y;
    return a.type() == b.type() && sameScalar(a, b);
}

// A class the broker does not know derives from nothing, rather than
// failing the traversal that asked.
bool derivesFrom(const CmpiObjectPath &path, const CmpiString &className) {
    try {
        return path.classPathIsA(className.charPtr());
    } catch (const CmpiStatus &) {
        return false;
    }
}

bool sameClass(const CmpiObjectPath &a, const CmpiObjectPath &b) {
    const CmpiString first = a.getClassName();
    const CmpiString second = b.getClassName();
    if (first.isNull() || second.isNull()) return false;
    return first.equalsIgnoreCase(second) || derivesFrom(a, second) || derivesFrom(b, first);
}

}  // namespace

bool sameObject(const CmpiObjectPath &a, const CmpiObjectPath &b) {
    const unsigned int count = a.getKeyCount();
    if (count != b.getKeyCount() || !sameClass(a, b)) return false;
    for (unsigned int index = 0; index < count; ++index) {
        CmpiString name;
        const CmpiData value = a.getKey(index, &name);
        if (!sameKeyValue(value, b.getKey(name.charPtr()))) return false;
    }
    return true;
}

}  // namespace OMC
