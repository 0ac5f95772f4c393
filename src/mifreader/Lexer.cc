#include "mifreader/Lexer.h"

#include <cstdio>
#include <limits>

namespace Mif {

namespace {

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

bool isLetter(char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
}

bool isWordCharacter(char c) {
    return isLetter(c) || isDigit(c) || c == '-' || c == '_';
}

bool isBlank(char c) {
    return c == ' ' || c == '\t' || c == '\r' || c == '\n';
}

char toLower(char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

int digitValue(char c) {
    if (isDigit(c)) {
        return c - '0';
    }
    const char lower = toLower(c);
    return lower >= 'a' && lower <= 'f' ? lower - 'a' + 10 : 16;
}

// The character set has graphic characters from 32 to 126 and from 160 on; a tab is harmless.
bool isText(char c) {
    const auto code = static_cast<unsigned char>(c);
    return c == '\t' || (code >= 32 && code <= 126) || code >= 160;
}

std::string shownCharacter(char c) {
    const auto code = static_cast<unsigned char>(c);
    if (code > 32 && code < 127) {
        return std::string("'") + c + "'";
    }
    char buffer[16];
    std::snprintf(buffer, sizeof buffer, "0x%02X", code);
    return std::string("octet ") + buffer;
}

}  // namespace

std::string Token::shown() const {
    switch (kind) {
        case Kind::Word:
        case Kind::Separator:
            return "'" + text + "'";
        case Kind::Integer:
            return (negative ? "-" : "") + std::to_string(magnitude);
        case Kind::Literal:
            return "a literal";
        case Kind::End:
            break;
    }
    return "the end of the file";
}

Lexer::Lexer(std::string_view theText, Tolerances theTolerances)
    : text(theText), tolerances(theTolerances) {
    if (text.substr(0, 2) == "\xFE\xFF" || text.substr(0, 2) == "\xFF\xFE") {
        throw Error(position, "two-octet Unicode is not read");
    }
}

Token Lexer::next() {
    skipBlanksAndComments();
    Token token;
    token.position = position;
    if (atEnd()) {
        return token;
    }
    const char c = peek();
    if (isLetter(c)) {
        return word();
    }
    if (isDigit(c) || c == '-') {
        return integer();
    }
    if (c == '"') {
        return literals();
    }
    if (std::string_view("=,{}()*").find(c) == std::string_view::npos) {
        throw Error(position, "unexpected " + shownCharacter(c));
    }
    token.kind = Token::Kind::Separator;
    token.text = take();
    return token;
}

char Lexer::take() {
    const char c = text[offset++];
    if (c == '\n') {
        ++position.line;
        position.column = 1;
    } else {
        ++position.column;
    }
    return c;
}

void Lexer::skipBlanksAndComments() {
    for (;;) {
        if (isBlank(peek())) {
            take();
        } else if (peek() == '/' && peek(1) == '/') {
            while (!atEnd() && peek() != '\n') {
                take();
            }
        } else if (peek() == '/' && peek(1) == '*') {
            skipBlockComment();
        } else {
            return;
        }
    }
}

void Lexer::skipBlockComment() {
    const Position start = position;
    take();
    take();
    while (peek() != '*' || peek(1) != '/') {
        if (atEnd()) {
            throw Error(start, "comment without end");
        }
        take();
    }
    take();
    take();
}

Token Lexer::word() {
    Token token;
    token.kind = Token::Kind::Word;
    token.position = position;
    while (isWordCharacter(peek())) {
        token.text += toLower(take());
    }
    return token;
}

Token Lexer::integer() {
    Token token;
    token.kind = Token::Kind::Integer;
    token.position = position;
    if (peek() == '-') {
        token.negative = true;
        take();
    }
    unsigned int radix = 10;
    if (peek() == '0' && toLower(peek(1)) == 'x') {
        radix = 16;
        take();
        take();
    } else if (peek() == '0') {
        radix = 8;
    }
    bool digits = false;
    while (isWordCharacter(peek())) {
        const auto digit = static_cast<unsigned int>(digitValue(peek()));
        if (digit >= radix) {
            throw Error(position, shownCharacter(peek()) + " in an integer");
        }
        if (token.magnitude > (std::numeric_limits<std::uint64_t>::max() - digit) / radix) {
            throw Error(token.position, "integer beyond 64 bits");
        }
        token.magnitude = token.magnitude * radix + digit;
        digits = true;
        take();
    }
    if (!digits) {
        throw Error(token.position, "integer without digits");
    }
    return token;
}

Token Lexer::literals() {
    Token token;
    token.kind = Token::Kind::Literal;
    token.position = position;
    while (peek() == '"') {
        literal(token.text);
        skipBlanksAndComments();
    }
    return token;
}

void Lexer::literal(std::string& decoded) {
    const Position start = position;
    take();
    while (peek() != '"') {
        if (atEnd()) {
            throw Error(start, "literal without end");
        }
        const char c = peek();
        if (c == '\\') {
            escape(decoded);
        } else if (c == '\r' || c == '\n') {
            lineEnd(decoded, Tolerance::BareLineEnds);
        } else if (!isText(c)) {
            throw Error(position, shownCharacter(c) + " in a literal");
        } else {
            decoded += take();
        }
    }
    take();
}

void Lexer::lineEnd(std::string& decoded, Tolerance tolerance) {
    if (!tolerances.has(tolerance)) {
        throw Error(position, "line end in a literal");
    }
    // CR and LF are one line end, also with a backslash between them.
    const bool second = peek() == '\n' && !decoded.empty() && decoded.back() == '\r';
    if (!second) {
        lineEnds.push_back(position);
    }
    decoded += take();
}

void Lexer::escape(std::string& decoded) {
    const Position start = position;
    take();
    if (atEnd()) {
        return;
    }
    const char c = peek();
    if (c == '\r' || c == '\n') {
        lineEnd(decoded, Tolerance::RawLineEnds);
        return;
    }
    if (tolerances.has(Tolerance::PlainBackslashes) && c != '"') {
        decoded += '\\';
        return;
    }
    if (c >= '0' && c <= '7') {
        decoded += octal();
        return;
    }
    take();
    static constexpr std::string_view kLetters = "abfnrtv\\\"";
    static constexpr std::string_view kMeanings = "\a\b\f\n\r\t\v\\\"";
    const std::size_t known = kLetters.find(c);
    if (c == 'x') {
        decoded += hexadecimal();
    } else if (known != std::string_view::npos) {
        decoded += kMeanings[known];
    } else {
        throw Error(start, "unknown escape: a backslash before " + shownCharacter(c));
    }
}

char Lexer::octal() {
    const Position start = position;
    int code = 0;
    for (int i = 0; i < 3 && peek() >= '0' && peek() <= '7'; ++i) {
        code = code * 8 + (take() - '0');
    }
    if (code > 255) {
        throw Error(start, "escape beyond one octet");
    }
    return static_cast<char>(code);
}

char Lexer::hexadecimal() {
    int code = 0;
    int digits = 0;
    while (digits < 2 && digitValue(peek()) < 16) {
        code = code * 16 + digitValue(take());
        ++digits;
    }
    if (digits == 0) {
        throw Error(position, "escape \\x without digits");
    }
    return static_cast<char>(code);
}

}  // namespace Mif
