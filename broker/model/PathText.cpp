#include "model/PathText.h"

#include <optional>

#include "model/CimDateTime.h"
#include "model/CimTypes.h"
#include "model/ValueText.h"

namespace tvxbroker {

namespace {

std::string quote(const std::string &text) {
    std::string out = "\"";
    for (const char c : text) {
        if (c == '"' || c == '\\') out += '\\';
        out += c;
    }
    return out + '"';
}

std::string formatKeyValue(const NamedValue &key) {
    if (key.value.null) return "NULL";
    std::string text;
    bool quoted = false;
    if (key.value.isArray() || !scalarText(key.value, text, quoted)) {
        throw std::invalid_argument("key " + key.name + " has a value that cannot appear in a path");
    }
    return quoted ? quote(text) : text;
}

bool isNameChar(char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') || c == '_';
}

class PathParser {
public:
    PathParser(const std::string &text, const ClassSchema &schema) : text_(text), schema_(schema) {}

    ObjectPath parse() {
        const std::size_t colon = text_.find(':');
        if (colon == std::string::npos) fail("missing ':' after the namespace", text_.size());
        if (colon == 0) fail("empty namespace", 0);
        ObjectPath path;
        path.nameSpace = text_.substr(0, colon);
        pos_ = colon + 1;
        const std::size_t classStart = pos_;
        const std::string className = readName();
        if (className.empty()) fail("empty class name", classStart);
        const ClassDecl *decl = schema_.find(className);
        if (!decl) throw UnknownClassError(className, classStart);
        path.className = decl->name;
        if (atEnd()) return path;
        if (text_[pos_] != '.') fail(unexpectedHere(), pos_);
        do {
            ++pos_;
            path.keys.push_back(readKey(path));
        } while (!atEnd() && text_[pos_] == ',');
        if (!atEnd()) fail(unexpectedHere(), pos_);
        return path;
    }

private:
    [[noreturn]] static void fail(const std::string &problem, std::size_t position) {
        throw PathParseError(problem, position);
    }

    bool atEnd() const { return pos_ >= text_.size(); }

    std::string unexpectedHere() const { return std::string("unexpected character '") + text_[pos_] + "'"; }

    std::string readName() {
        const std::size_t start = pos_;
        while (!atEnd() && isNameChar(text_[pos_])) ++pos_;
        return text_.substr(start, pos_ - start);
    }

    NamedValue readKey(const ObjectPath &path) {
        const std::size_t keyStart = pos_;
        const std::string name = readName();
        if (name.empty()) fail("expected a key name", keyStart);
        if (atEnd() || text_[pos_] != '=') fail("missing '=' after key " + name, pos_);
        ++pos_;
        if (path.key(name)) fail("duplicate key " + name, keyStart);
        const PropertyDecl *property = schema_.findProperty(path.className, name);
        if (!property) fail("class " + path.className + " has no property " + name, keyStart);
        return {property->name, readValue(*property)};
    }

    CimValue readValue(const PropertyDecl &property) {
        const std::size_t start = pos_;
        if (!atEnd() && text_[pos_] == '"') return convertQuoted(property, readQuoted(), start);
        const std::size_t end = text_.find(',', pos_);
        pos_ = end == std::string::npos ? text_.size() : end;
        const std::string bare = text_.substr(start, pos_ - start);
        if (bare.empty()) fail("missing value of key " + property.name, start);
        return convertBare(property, bare, start);
    }

    std::string readQuoted() {
        const std::size_t start = pos_++;
        std::string value;
        for (; !atEnd(); ++pos_) {
            const char c = text_[pos_];
            if (c == '"') {
                ++pos_;
                return value;
            }
            if (c == '\\') {
                if (pos_ + 1 >= text_.size() || (text_[pos_ + 1] != '"' && text_[pos_ + 1] != '\\')) {
                    fail("invalid escape", pos_);
                }
                ++pos_;
            }
            value += text_[pos_];
        }
        fail("unterminated quoted value", start);
    }

    CimValue convertQuoted(const PropertyDecl &property, const std::string &value, std::size_t at) const {
        const std::string &name = property.name;
        std::uint64_t codeUnit = 0;
        DateTime dateTime;
        switch (kindOf(property, at)) {
        case ValueKind::Text:
            return CimValue::makeString(value);
        case ValueKind::DateTime:
            if (!parseCimDateTime(value, dateTime)) fail("value of " + name + " is not a CIM datetime", at);
            return CimValue::makeDateTime(dateTime);
        case ValueKind::Reference:
            try {
                return CimValue::makeReference(parsePath(value, schema_));
            } catch (const PathParseError &inner) {
                fail("invalid reference in " + name + " (" + inner.what() + ")", at);
            }
        case ValueKind::Unsigned:
            if (property.type == CMPI_char16) {
                if (!readChar16(value, codeUnit)) fail("value of " + name + " is not a single character", at);
                return CimValue::makeUnsigned(CMPI_char16, codeUnit);
            }
            break;
        default:
            break;
        }
        fail("value of " + name + " must not be quoted", at);
    }

    CimValue convertBare(const PropertyDecl &property, const std::string &value, std::size_t at) const {
        kindOf(property, at);
        if (equalsIgnoreCase(value, "NULL")) return CimValue::makeNull(property.type);
        std::string problem;
        const std::optional<CimValue> scalar = bareScalarValue(property.type, property.name, value, problem);
        if (!scalar) fail(problem, at);
        return *scalar;
    }

    static ValueKind kindOf(const PropertyDecl &property, std::size_t at) {
        const ValueKind kind = (property.type & CMPI_ARRAY) ? ValueKind::None : valueKind(property.type);
        if (kind == ValueKind::None || kind == ValueKind::Instance) {
            fail("property " + property.name + " has a type that cannot appear in a path", at);
        }
        return kind;
    }

    const std::string &text_;
    const ClassSchema &schema_;
    std::size_t pos_ = 0;
};

}  // namespace

PathParseError::PathParseError(const std::string &problem, std::size_t position)
    : std::runtime_error(problem + " at position " + std::to_string(position)), position_(position) {}

UnknownClassError::UnknownClassError(const std::string &className, std::size_t position)
    : PathParseError("unknown class " + className, position), className_(className) {}

std::string formatPath(const ObjectPath &path) {
    std::string out = path.nameSpace.empty() ? path.className : path.nameSpace + ":" + path.className;
    for (std::size_t i = 0; i < path.keys.size(); ++i) {
        out += i == 0 ? '.' : ',';
        out += path.keys[i].name + "=" + formatKeyValue(path.keys[i]);
    }
    return out;
}

ObjectPath parsePath(const std::string &text, const ClassSchema &schema) { return PathParser(text, schema).parse(); }

}  // namespace tvxbroker
