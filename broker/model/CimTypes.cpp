#include "model/CimTypes.h"

#include "model/CimValue.h"

namespace tvxbroker {

namespace {

struct TypeName {
    const char *name;
    CMPIType type;
};

const TypeName typeNames[] = {
    {"string", CMPI_string}, {"boolean", CMPI_boolean}, {"char16", CMPI_char16},
    {"uint8", CMPI_uint8},   {"uint16", CMPI_uint16},   {"uint32", CMPI_uint32},
    {"uint64", CMPI_uint64}, {"sint8", CMPI_sint8},     {"sint16", CMPI_sint16},
    {"sint32", CMPI_sint32}, {"sint64", CMPI_sint64},   {"real32", CMPI_real32},
    {"real64", CMPI_real64}, {"datetime", CMPI_dateTime},
};

}  // namespace

ValueKind valueKind(CMPIType scalarType) {
    switch (scalarType) {
    case CMPI_boolean:
        return ValueKind::Boolean;
    case CMPI_char16:
    case CMPI_uint8:
    case CMPI_uint16:
    case CMPI_uint32:
    case CMPI_uint64:
        return ValueKind::Unsigned;
    case CMPI_sint8:
    case CMPI_sint16:
    case CMPI_sint32:
    case CMPI_sint64:
        return ValueKind::Signed;
    case CMPI_real32:
    case CMPI_real64:
        return ValueKind::Real;
    case CMPI_string:
    case CMPI_chars:
        return ValueKind::Text;
    case CMPI_dateTime:
        return ValueKind::DateTime;
    case CMPI_ref:
        return ValueKind::Reference;
    case CMPI_instance:
        return ValueKind::Instance;
    default:
        return ValueKind::None;
    }
}

std::string cimTypeName(CMPIType scalarType) {
    for (const TypeName &entry : typeNames) {
        if (entry.type == scalarType) return entry.name;
    }
    return {};
}

bool cimTypeFromName(const std::string &name, CMPIType &type) {
    for (const TypeName &entry : typeNames) {
        if (equalsIgnoreCase(name, entry.name)) {
            type = entry.type;
            return true;
        }
    }
    return false;
}

unsigned integerBits(CMPIType scalarType) {
    switch (scalarType) {
    case CMPI_uint8:
    case CMPI_sint8:
        return 8;
    case CMPI_uint16:
    case CMPI_sint16:
        return 16;
    case CMPI_uint32:
    case CMPI_sint32:
        return 32;
    case CMPI_uint64:
    case CMPI_sint64:
        return 64;
    default:
        return 0;
    }
}

}  // namespace tvxbroker
