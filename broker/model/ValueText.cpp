#include "model/ValueText.h"

#include <charconv>

#include "model/CimDateTime.h"
#include "model/CimTypes.h"
#include "model/PathText.h"

namespace tvxbroker {

namespace {

template <typename Number>
bool readWhole(const std::string &text, Number &number) {
    const char *end = text.data() + text.size();
    const auto result = std::from_chars(text.data(), end, number);
    return result.ec == std::errc() && result.ptr == end;
}

}  // namespace

std::optional<CimValue> bareScalarValue(CMPIType type, const std::string &name, const std::string &text,
                                        std::string &problem) {
    const ValueKind kind = valueKind(type);
    const auto refuse = [&](const std::string &why) {
        problem = why;
        return std::nullopt;
    };
    if (kind == ValueKind::Boolean) {
        if (equalsIgnoreCase(text, "TRUE") || equalsIgnoreCase(text, "FALSE")) {
            return CimValue::makeBoolean(equalsIgnoreCase(text, "TRUE"));
        }
        return refuse("value of " + name + " is not TRUE or FALSE");
    }
    if (kind == ValueKind::Real) {
        double real = 0;
        if (!readWhole(text, real)) return refuse("value of " + name + " is not a real number");
        return CimValue::makeReal(type, real);
    }
    const unsigned bits = integerBits(type);
    if (bits == 0) return refuse("value of " + name + " must be quoted");
    const std::string outOfRange = "value " + text + " of " + name + " is out of range for " + cimTypeName(type);
    if (kind == ValueKind::Unsigned) {
        std::uint64_t number = 0;
        if (!readWhole(text, number)) return refuse("value of " + name + " is not an unsigned integer");
        if (bits < 64 && number >> bits) return refuse(outOfRange);
        return CimValue::makeUnsigned(type, number);
    }
    std::int64_t number = 0;
    if (!readWhole(text, number)) return refuse("value of " + name + " is not an integer");
    const std::int64_t limit = bits < 64 ? std::int64_t(1) << (bits - 1) : 0;
    if (bits < 64 && (number < -limit || number >= limit)) return refuse(outOfRange);
    return CimValue::makeSigned(type, number);
}

bool scalarText(const CimValue &scalar, std::string &text, bool &quoted) {
    quoted = true;
    switch (valueKind(scalar.type)) {
    case ValueKind::Text:
        text = scalar.text;
        return true;
    case ValueKind::DateTime:
        text = formatCimDateTime(scalar.dateTime);
        return true;
    case ValueKind::Reference:
        if (scalar.reference) text = formatPath(*scalar.reference);
        return scalar.reference != nullptr;
    case ValueKind::Instance:
        if (scalar.instance) text = formatPath(scalar.instance->path);
        return scalar.instance != nullptr;
    case ValueKind::Unsigned:
        quoted = scalar.type == CMPI_char16;
        text = quoted ? char16Text(scalar.unsignedValue) : std::to_string(scalar.unsignedValue);
        return true;
    case ValueKind::Signed:
        quoted = false;
        text = std::to_string(scalar.signedValue);
        return true;
    case ValueKind::Boolean:
        quoted = false;
        text = scalar.boolean ? "TRUE" : "FALSE";
        return true;
    case ValueKind::Real: {
        quoted = false;
        char buffer[64];
        text.assign(buffer, std::to_chars(buffer, buffer + sizeof buffer, scalar.real).ptr);
        return true;
    }
    case ValueKind::None:
        break;
    }
    return false;
}

std::string char16Text(std::uint64_t codeUnit) {
    const auto byte = [](std::uint64_t bits) { return static_cast<char>(bits); };
    if (codeUnit < 0x80) return std::string(1, byte(codeUnit));
    if (codeUnit < 0x800) return {byte(0xC0 | codeUnit >> 6), byte(0x80 | (codeUnit & 0x3F))};
    return {byte(0xE0 | (codeUnit >> 12 & 0x0F)), byte(0x80 | (codeUnit >> 6 & 0x3F)), byte(0x80 | (codeUnit & 0x3F))};
}

bool readChar16(const std::string &text, std::uint64_t &codeUnit) {
    if (text.empty()) return false;
    const auto lead = static_cast<unsigned char>(text[0]);
    const std::size_t length = lead < 0x80 ? 1 : (lead & 0xE0) == 0xC0 ? 2 : (lead & 0xF0) == 0xE0 ? 3 : 0;
    if (length == 0 || text.size() != length) return false;
    std::uint64_t unit = length == 1 ? lead : lead & (length == 2 ? 0x1F : 0x0F);
    for (std::size_t i = 1; i < length; ++i) {
        const auto next = static_cast<unsigned char>(text[i]);
        if ((next & 0xC0) != 0x80) return false;
        unit = unit << 6 | (next & 0x3F);
    }
    // An overlong form would give a second spelling of the same character.
    static const std::uint64_t smallest[] = {0, 0, 0x80, 0x800};
    if (unit < smallest[length]) return false;
    codeUnit = unit;
    return true;
}

}  // namespace tvxbroker
