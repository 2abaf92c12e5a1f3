// Literal text shared by the path text and MOF output.
#pragma once

#include <cstdint>
#include <optional>
#include <string>

#include "model/CimValue.h"

namespace tvxbroker {

// A non-null scalar as literal text before quoting. `quoted` is set for text
// that goes in quotes: strings, char16, datetime, and the path of a reference
// or embedded instance. Booleans are TRUE/FALSE, integers decimal and reals
// in their shortest exact form. False for a type without a literal.
bool scalarText(const CimValue &scalar, std::string &text, bool &quoted);

// A scalar of `type` from its unquoted literal text, as paths and MOF write
// it: TRUE or FALSE in any case for a boolean, a decimal integer within the
// type's range, a real number. Otherwise nothing, and `problem` says why,
// naming the property `name` ("value of <name> is not an integer", ...).
std::optional<CimValue> bareScalarValue(CMPIType type, const std::string &name, const std::string &text,
                                        std::string &problem);

// A char16 code unit as UTF-8, and back: false unless `text` is exactly one
// character of the basic multilingual plane.
std::string char16Text(std::uint64_t codeUnit);
bool readChar16(const std::string &text, std::uint64_t &codeUnit);

}  // namespace tvxbroker
