#include "model/MofInstanceText.h"

#include <cstdio>

#include "model/PathText.h"
#include "model/ValueText.h"

namespace tvxbroker {

namespace {

std::string escapeChar(char c, char quote) {
    switch (c) {
    case '\n':
        return "\\n";
    case '\t':
        return "\\t";
    case '\r':
        return "\\r";
    case '\b':
        return "\\b";
    case '\f':
        return "\\f";
    case '\\':
        return "\\\\";
    default:
        break;
    }
    if (c == quote) return std::string("\\") + c;
    const auto byte = static_cast<unsigned char>(c);
    if (byte < 0x20 || byte == 0x7f) {
        // Always four digits, so that a following hex digit is not read as part of the escape.
        char buffer[8];
        std::snprintf(buffer, sizeof buffer, "\\x%04x", byte);
        return buffer;
    }
    return std::string(1, c);
}

std::string mofQuoted(const std::string &text, char quote) {
    std::string out(1, quote);
    for (const char c : text) out += escapeChar(c, quote);
    return out + quote;
}

std::string mofScalar(const CimValue &value) {
    std::string text;
    bool quoted = false;
    if (value.null || !scalarText(value, text, quoted)) return "NULL";
    if (!quoted) return text;
    return mofQuoted(text, value.type == CMPI_char16 ? '\'' : '"');
}

std::string mofLiteral(const CimValue &value) {
    if (value.null || !value.isArray()) return mofScalar(value);
    std::string out = "{";
    for (std::size_t i = 0; i < value.elements.size(); ++i) {
        if (i > 0) out += ", ";
        out += mofScalar(value.elements[i]);
    }
    return out + "}";
}

// A line break in a key would end the comment early and leave the rest as MOF.
std::string commentText(std::string text) {
    for (char &c : text) {
        if (c == '\n' || c == '\r') c = ' ';
    }
    return text;
}

}  // namespace

std::string formatInstanceMof(const Instance &instance) {
    std::string out = "// " + commentText(formatPath(instance.path)) + "\n";
    out += "instance of " + instance.path.className + "\n{\n";
    for (const NamedValue &property : instance.properties) {
        out += "    " + property.name + " = " + mofLiteral(property.value) + ";\n";
    }
    return out + "};\n";
}

}  // namespace tvxbroker
