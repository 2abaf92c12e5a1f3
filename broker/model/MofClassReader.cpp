#include "model/MofClassReader.h"

#include <optional>
#include <utility>

#include "model/CimTypes.h"
#include "model/CimDateTime.h"
#include "model/CimValue.h"
#include "model/MofLexer.h"
#include "model/ValueText.h"

namespace tvxbroker {

namespace {

struct Qualifiers {
    bool key = false;
    bool association = false;
    bool indication = false;
};

char closerOf(const MofToken &token) {
    if (token.isPunct('(')) return ')';
    if (token.isPunct('[')) return ']';
    if (token.isPunct('{')) return '}';
    return '\0';
}

bool isCloser(const MofToken &token) { return token.isPunct(')') || token.isPunct(']') || token.isPunct('}'); }

std::string describe(const MofToken &token) {
    switch (token.kind) {
    case MofToken::End:
        return "end of input";
    case MofToken::String:
        return "a string";
    case MofToken::Char:
        return "a character literal";
    case MofToken::Alias:
        return "'$" + token.text + "'";
    default:
        return "'" + token.text + "'";
    }
}

class Reader {
public:
    Reader(const std::string &text, const std::string &origin) : lexer_(text, origin) { advance(); }

    std::vector<ClassAtLine> readAll() {
        std::vector<ClassAtLine> classes;
        while (token_.kind != MofToken::End) {
            const bool qualified = token_.isPunct('[');
            const Qualifiers qualifiers = qualified ? readQualifiers() : Qualifiers{};
            if (token_.isWord("class")) {
                classes.push_back(readClass(qualifiers));
            } else if (token_.isWord("instance")) {
                advance();
                if (!token_.isWord("of")) unexpected("'of'");
                advance();
                expectIdentifier("class name");
                skipPastSemicolon();
            } else if (!qualified && token_.isWord("qualifier")) {
                skipPastSemicolon();
            } else {
                unexpected("a class, instance or qualifier declaration");
            }
        }
        return classes;
    }

private:
    void advance() { token_ = lexer_.next(); }

    [[noreturn]] void unexpected(const std::string &expected) const {
        lexer_.fail(token_.line, "expected " + expected + ", found " + describe(token_));
    }

    std::string expectIdentifier(const char *what) {
        if (token_.kind != MofToken::Identifier) unexpected(what);
        std::string text = std::move(token_.text);
        advance();
        return text;
    }

    void expectPunct(char c) {
        if (!token_.isPunct(c)) unexpected(std::string("'") + c + "'");
        advance();
    }

    // From an opening bracket through its partner; returns what is between.
    std::vector<MofToken> readGroup() {
        const MofToken opener = token_;
        std::string closers(1, closerOf(token_));
        std::vector<MofToken> inside;
        advance();
        while (!closers.empty()) {
            if (token_.kind == MofToken::End) lexer_.fail(opener.line, "'" + opener.text + "' never closed");
            if (closerOf(token_)) {
                closers += closerOf(token_);
            } else if (isCloser(token_)) {
                if (!token_.isPunct(closers.back())) unexpected("'" + std::string(1, closers.back()) + "'");
                closers.pop_back();
            }
            if (!closers.empty()) inside.push_back(token_);
            advance();
        }
        return inside;
    }

    void skipPastSemicolon() {
        while (!token_.isPunct(';')) {
            if (token_.kind == MofToken::End || isCloser(token_)) unexpected("';'");
            if (closerOf(token_)) {
                readGroup();
            } else {
                advance();
            }
        }
        advance();
    }

    Qualifiers readQualifiers() {
        Qualifiers result;
        advance();
        for (;;) {
            const std::string name = expectIdentifier("a qualifier name");
            bool value = true;
            if (closerOf(token_) == ')' || closerOf(token_) == '}') {
                const std::vector<MofToken> argument = readGroup();
                value = !(argument.size() == 1 && argument[0].isWord("false"));
            }
            if (token_.isPunct(':')) {
                for (advance(); token_.kind == MofToken::Identifier;) advance();  // flavors
            }
            if (equalsIgnoreCase(name, "key")) result.key = value;
            if (equalsIgnoreCase(name, "association")) result.association = value;
            if (equalsIgnoreCase(name, "indication")) result.indication = value;
            if (token_.isPunct(']')) break;
            if (!token_.isPunct(',')) unexpected("',' or ']'");
            advance();
        }
        advance();
        return result;
    }

    ClassAtLine readClass(const Qualifiers &qualifiers) {
        ClassAtLine result{{}, token_.line};
        ClassDecl &decl = result.decl;
        advance();
        decl.name = expectIdentifier("a class name");
        decl.association = qualifiers.association;
        decl.indication = qualifiers.indication;
        if (token_.isPunct(':')) {
            advance();
            decl.superclass = expectIdentifier("a superclass name");
        }
        expectPunct('{');
        while (!token_.isPunct('}')) readFeature(decl);
        advance();
        expectPunct(';');
        return result;
    }

    void readFeature(ClassDecl &decl) {
        const Qualifiers qualifiers = token_.isPunct('[') ? readQualifiers() : Qualifiers{};
        const MofToken type = token_;
        expectIdentifier("a property or method declaration");
        PropertyDecl property;
        property.key = qualifiers.key;
        const int line = token_.line;
        property.name = expectIdentifier("a property or method name");
        // "REF" followed by a name makes the first word a class; alone it is the name.
        if (equalsIgnoreCase(property.name, "ref") && token_.kind == MofToken::Identifier) {
            property.type = CMPI_ref;
            property.referenceClass = type.text;
            property.name = expectIdentifier("a property name");
        }
        if (token_.isPunct('(')) {
            readGroup();
            expectPunct(';');
            return;
        }
        if (property.type != CMPI_ref && !cimTypeFromName(type.text, property.type)) {
            lexer_.fail(type.line, "unknown type '" + type.text + "'");
        }
        if (token_.isPunct('[')) {
            advance();
            if (token_.kind == MofToken::Number) advance();
            expectPunct(']');
            property.type |= CMPI_ARRAY;
        }
        if (token_.isPunct('=')) {
            advance();
            property.defaultValue = readDefault(property);
        }
        expectPunct(';');
        for (const PropertyDecl &earlier : decl.properties) {
            if (equalsIgnoreCase(earlier.name, property.name)) {
                lexer_.fail(line, "property " + property.name + " declared twice in class " + decl.name);
            }
        }
        decl.properties.push_back(std::move(property));
    }

    // A property's initializer, typed as the property: brokers fill it into
    // every new instance of the class.
    CimValue readDefault(const PropertyDecl &property) {
        if (token_.isWord("null")) {
            advance();
            return CimValue::makeNull(property.type);
        }
        const CMPIType elementType = static_cast<CMPIType>(property.type & ~CMPI_ARRAY);
        if ((property.type & CMPI_ARRAY) == 0) return readLiteral(elementType, property.name);
        expectPunct('{');
        std::vector<CimValue> elements;
        while (!token_.isPunct('}')) {
            if (!elements.empty()) expectPunct(',');
            elements.push_back(readLiteral(elementType, property.name));
        }
        advance();
        return CimValue::makeArray(elementType, std::move(elements));
    }

    CimValue readLiteral(CMPIType type, const std::string &property) {
        const int line = token_.line;
        const bool negative = token_.isPunct('-');
        if (negative) advance();
        const MofToken literal = token_;
        advance();
        if (literal.kind == MofToken::String && !negative && (type == CMPI_string || type == CMPI_dateTime)) {
            std::string text = unescaped(literal.text);
            while (token_.kind == MofToken::String) {  // adjacent literals join
                text += unescaped(token_.text);
                advance();
            }
            if (type == CMPI_string) return CimValue::makeString(std::move(text));
            DateTime dateTime;
            if (!parseCimDateTime(text, dateTime)) lexer_.fail(line, "default value of " + property + " is not a CIM datetime");
            return CimValue::makeDateTime(dateTime);
        }
        if (literal.kind != MofToken::Number && literal.kind != MofToken::Identifier) {
            lexer_.fail(line, "default value of " + property + " does not fit its type");
        }
        std::string problem;
        const std::optional<CimValue> value =
            bareScalarValue(type, property, (negative ? "-" : "") + literal.text, problem);
        if (!value) lexer_.fail(line, "default " + problem);
        return *value;
    }

    static std::string unescaped(const std::string &literal) {
        std::string text;
        for (std::size_t i = 0; i < literal.size(); ++i) {
            if (literal[i] != '\\' || i + 1 == literal.size()) {
                text += literal[i];
                continue;
            }
            const char escaped = literal[++i];
            text += escaped == 'n' ? '\n' : escaped == 't' ? '\t' : escaped == 'r' ? '\r' : escaped;
        }
        return text;
    }

    MofLexer lexer_;
    MofToken token_;
};

}  // namespace

std::vector<ClassAtLine> readMofClasses(const std::string &text, const std::string &origin) {
    return Reader(text, origin).readAll();
}

}  // namespace tvxbroker
