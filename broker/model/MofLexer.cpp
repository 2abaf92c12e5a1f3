#include "model/MofLexer.h"

#include <cstdio>
#include <cstring>
#include <utility>

#include "model/CimValue.h"
#include "model/TextSource.h"

namespace tvxbroker {

namespace {

bool isLetter(char c) { return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || c == '_'; }
bool isDigit(char c) { return c >= '0' && c <= '9'; }
bool isSpace(char c) { return c == ' ' || c == '\t' || c == '\r' || c == '\n' || c == '\f' || c == '\v'; }

std::string describe(char c) {
    char buffer[32];
    const auto byte = static_cast<unsigned char>(c);
    if (byte >= 0x20 && byte < 0x7f) {
        std::snprintf(buffer, sizeof buffer, "'%c'", c);
    } else {
        std::snprintf(buffer, sizeof buffer, "byte 0x%02x", byte);
    }
    return buffer;
}

}  // namespace

bool MofToken::isWord(const char *word) const { return kind == Identifier && equalsIgnoreCase(text, word); }

MofLexer::MofLexer(const std::string &text, std::string origin) : text_(text), origin_(std::move(origin)) {
    if (text_.compare(0, 3, "\xEF\xBB\xBF") == 0) pos_ = 3;
}

void MofLexer::fail(int line, const std::string &message) const { throwAt(origin_, line, message); }

MofToken MofLexer::next() {
    for (;;) {
        skipSpaceAndComments();
        if (pos_ >= text_.size()) return {MofToken::End, "", line_};
        const char c = text_[pos_];
        const char after = pos_ + 1 < text_.size() ? text_[pos_ + 1] : '\0';
        if (c == '#') {
            skipDirective();
        } else if (c == '"' || c == '\'') {
            return quoted(c);
        } else if (isLetter(c)) {
            return word(MofToken::Identifier);
        } else if (c == '$' && isLetter(after)) {
            ++pos_;
            return word(MofToken::Alias);
        } else if (isDigit(c) || ((c == '+' || c == '-' || c == '.') && isDigit(after))) {
            return number();
        } else if (c != '\0' && std::strchr("[](){},;:=", c)) {
            ++pos_;
            return {MofToken::Punct, std::string(1, c), line_};
        } else {
            fail(line_, "unexpected " + describe(c));
        }
    }
}

void MofLexer::skipSpaceAndComments() {
    while (pos_ < text_.size()) {
        if (isSpace(text_[pos_])) {
            if (text_[pos_] == '\n') ++line_;
            ++pos_;
        } else if (text_.compare(pos_, 2, "//") == 0) {
            pos_ = text_.find('\n', pos_);
            if (pos_ == std::string::npos) pos_ = text_.size();
        } else if (text_.compare(pos_, 2, "/*") == 0) {
            const std::size_t end = text_.find("*/", pos_ + 2);
            if (end == std::string::npos) fail(line_, "unterminated comment");
            for (; pos_ < end + 2; ++pos_) {
                if (text_[pos_] == '\n') ++line_;
            }
        } else {
            return;
        }
    }
}

void MofLexer::skipDirective() {
    ++pos_;
    const MofToken name = word(MofToken::Identifier);
    if (!name.isWord("pragma")) fail(line_, "unknown directive '#" + name.text + "'");
    pos_ = text_.find('\n', pos_);
    if (pos_ == std::string::npos) pos_ = text_.size();
}

MofToken MofLexer::quoted(char quote) {
    const std::size_t start = pos_++;
    for (; pos_ < text_.size() && text_[pos_] != '\n'; ++pos_) {
        if (text_[pos_] == '\\' && pos_ + 1 < text_.size() && text_[pos_ + 1] != '\n') {
            ++pos_;
        } else if (text_[pos_] == quote) {
            ++pos_;
            return {quote == '"' ? MofToken::String : MofToken::Char, text_.substr(start + 1, pos_ - start - 2),
                    line_};
        }
    }
    fail(line_, quote == '"' ? "unterminated string" : "unterminated character literal");
}

MofToken MofLexer::word(MofToken::Kind kind) {
    const std::size_t start = pos_;
    while (pos_ < text_.size() && (isLetter(text_[pos_]) || isDigit(text_[pos_]))) ++pos_;
    return {kind, text_.substr(start, pos_ - start), line_};
}

MofToken MofLexer::number() {
    const std::size_t start = pos_++;
    while (pos_ < text_.size()) {
        const char c = text_[pos_];
        const char previous = text_[pos_ - 1];
        const bool exponentSign = (c == '+' || c == '-') && (previous == 'e' || previous == 'E');
        if (!isLetter(c) && !isDigit(c) && c != '.' && !exponentSign) break;
        ++pos_;
    }
    return {MofToken::Number, text_.substr(start, pos_ - start), line_};
}

}  // namespace tvxbroker
