// What the CMPI type codes mean for the model: which CimValue member carries
// a value, the MOF keyword of each type, and the width of integer types.
#pragma once

#include <string>

#include "cmpi/cmpidt.h"

namespace tvxbroker {

enum class ValueKind { None, Boolean, Unsigned, Signed, Real, Text, DateTime, Reference, Instance };

// The member of CimValue that holds a scalar of this type (char16 is Unsigned).
ValueKind valueKind(CMPIType scalarType);

// The MOF keyword ("uint8", "string", "datetime", ...); empty for types MOF
// does not name, such as references.
std::string cimTypeName(CMPIType scalarType);

// Case-insensitive inverse of cimTypeName.
bool cimTypeFromName(const std::string &name, CMPIType &type);

// 8, 16, 32 or 64 for uint8..sint64; 0 for everything else, char16 included.
unsigned integerBits(CMPIType scalarType);

}  // namespace tvxbroker
