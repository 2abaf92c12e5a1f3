// Splits MOF text into tokens, dropping comments and #pragma lines.
#pragma once

#include <cstddef>
#include <string>

namespace tvxbroker {

struct MofToken {
    enum Kind { End, Identifier, String, Char, Number, Alias, Punct };
    Kind kind = End;
    std::string text;  // string and char literals keep their escapes
    int line = 0;

    bool isPunct(char c) const { return kind == Punct && text.size() == 1 && text[0] == c; }
    bool isWord(const char *word) const;  // an identifier, case-insensitive
};

class MofLexer {
public:
    // `text` must outlive the lexer.
    MofLexer(const std::string &text, std::string origin);

    // Throws std::runtime_error "origin:line: message" on text that is no token.
    MofToken next();

    // "origin:line: message", for the parser's errors.
    [[noreturn]] void fail(int line, const std::string &message) const;

private:
    void skipSpaceAndComments();
    MofToken quoted(char quote);
    MofToken word(MofToken::Kind kind);
    MofToken number();
    void skipDirective();

    const std::string &text_;
    std::string origin_;
    std::size_t pos_ = 0;
    int line_ = 1;
};

}  // namespace tvxbroker
