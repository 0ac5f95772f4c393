#include "mof/MofLexer.h"

#include <fmt/format.h>

#include "mof/MofNumber.h"
#include "text/Utf8.h"
#include "utf8/Utf8.h"

namespace cimomd {
namespace {

constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";
constexpr std::string_view kPunctuation = "[]{}(),;:=";
constexpr std::size_t kMaxHexDigits = 4;

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

bool isNameStart(char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || c == '_' ||
           static_cast<unsigned char>(c) >= 0x80;
}

bool isBlank(char c) {
    return c == ' ' || c == '\t' || c == '\r' || c == '\n' || c == '\f';
}

bool isContinuationByte(char c) {
    return (static_cast<unsigned char>(c) & 0xC0) == 0x80;
}

int hexDigit(char c) {
    if (isDigit(c))
        return c - '0';
    if (c >= 'a' && c <= 'f')
        return c - 'a' + 10;
    if (c >= 'A' && c <= 'F')
        return c - 'A' + 10;
    return -1;
}

std::string describe(char c) {
    const auto byte = static_cast<unsigned char>(c);
    if (byte < 0x20 || byte >= 0x7F)
        return fmt::format("the byte 0x{:02X}", byte);
    return fmt::format("'{}'", c);
}

}  // namespace

MofLexer::MofLexer(std::string_view mofText, std::string_view fileName, MofErrorLog& errorLog)
    : text(mofText), file(fileName), log(errorLog) {
    if (text.substr(0, kByteOrderMark.size()) == kByteOrderMark)
        offset = kByteOrderMark.size();
}

MofToken MofLexer::next() {
    for (skipBlanksAndComments(); !atEnd(); skipBlanksAndComments()) {
        const char c = current();
        if (startsNumber())
            return number();
        if (isNameStart(c))
            return identifier();
        if (c == '"')
            return quoted('"', MofTokenKind::String);
        if (c == '\'')
            return quoted('\'', MofTokenKind::Char);
        if (c == '$' && isNameStart(peek(1)))
            return alias();
        if (kPunctuation.find(c) != std::string_view::npos)
            return punctuation();
        if (c == '#') {
            const MofPosition start = position;
            const std::size_t startOffset = offset;
            if (startsPragma())
                return tokenFrom(MofTokenKind::Pragma, startOffset, start);
            continue;
        }
        report(position, describe(c), "a declaration");
        advance();
    }
    return tokenFrom(MofTokenKind::End, offset, position);
}

char MofLexer::peek(std::size_t distance) const {
    return offset + distance < text.size() ? text[offset + distance] : '\0';
}

void MofLexer::advance() {
    const char passed = text[offset++];
    const bool endsLine = passed == '\n' || (passed == '\r' && (atEnd() || text[offset] != '\n'));
    if (endsLine) {
        ++position.line;
        position.column = 1;
    } else if (atEnd() || !isContinuationByte(text[offset])) {
        ++position.column;
    }
}

void MofLexer::skipLine() {
    while (!atEnd() && current() != '\n' && current() != '\r')
        advance();
}

void MofLexer::skipBlanksAndComments() {
    while (!atEnd()) {
        if (isBlank(current())) {
            advance();
        } else if (current() == '/' && peek(1) == '/') {
            skipLine();
        } else if (current() == '/' && peek(1) == '*') {
            skipBlockComment();
        } else {
            return;
        }
    }
}

void MofLexer::skipBlockComment() {
    const MofPosition start = position;
    advance();
    advance();
    while (!atEnd()) {
        if (current() == '*' && peek(1) == '/') {
            advance();
            advance();
            return;
        }
        advance();
    }
    report(start, "a comment without an end", "*/");
}

MofToken MofLexer::identifier() {
    const MofPosition start = position;
    const std::size_t startOffset = offset;
    while (!atEnd() && (isNameStart(current()) || isDigit(current())))
        advance();
    return tokenFrom(MofTokenKind::Identifier, startOffset, start);
}

bool MofLexer::startsNumber() const {
    const char c = current();
    const bool isSigned = c == '+' || c == '-';
    const char first = isSigned ? peek(1) : c;
    const char second = isSigned ? peek(2) : peek(1);
    return isDigit(first) || (first == '.' && isDigit(second));
}

MofToken MofLexer::number() {
    const MofPosition start = position;
    const std::size_t startOffset = offset;
    if (current() == '+' || current() == '-')
        advance();
    const bool isHex = current() == '0' && (peek(1) == 'x' || peek(1) == 'X');
    advance();
    while (!atEnd()) {
        const char c = current();
        const char before = text[offset - 1];
        const bool exponentSign =
            (c == '+' || c == '-') && !isHex && (before == 'e' || before == 'E');
        if (!isNameStart(c) && !isDigit(c) && c != '.' && !exponentSign)
            break;
        advance();
    }
    MofToken token = tokenFrom(MofTokenKind::Integer, startOffset, start);
    if (!parseMofNumber(token)) {
        report(start, shownText(token.text), "a number within 64 bits");
        token.magnitude = 1;  // fits every type, so that the value is not told again
    }
    return token;
}

/// Passes the word #pragma. False, and the line is passed, when it is another one.
bool MofLexer::startsPragma() {
    const MofPosition start = position;
    const std::size_t startOffset = offset;
    advance();
    while (!atEnd() && isNameStart(current()))
        advance();
    const std::string_view word = text.substr(startOffset, offset - startOffset);
    if (equalsIgnoringCase(word, "#pragma"))
        return true;
    report(start, shownText(word), "#pragma");
    skipLine();
    return false;
}

MofToken MofLexer::alias() {
    const MofPosition start = position;
    const std::size_t startOffset = offset;
    advance();
    MofToken token = identifier();
    token.characters = utf8::clean(token.text);
    token.kind = MofTokenKind::Alias;
    token.text = text.substr(startOffset, offset - startOffset);
    token.position = start;
    return token;
}

MofToken MofLexer::punctuation() {
    const MofPosition start = position;
    const std::size_t startOffset = offset;
    advance();
    return tokenFrom(MofTokenKind::Punctuation, startOffset, start);
}

MofToken MofLexer::quoted(char quote, MofTokenKind kind) {
    const MofPosition start = position;
    const std::size_t startOffset = offset;
    std::string characters;
    advance();
    bool isClosed = false;
    while (!isClosed) {
        if (atEnd()) {
            report(start, "a text without an end", fmt::format("a closing {}", quote));
            break;
        }
        if (current() == '\n' || current() == '\r') {
            report(position, "the end of the line", fmt::format("a closing {}", quote));
            stepBackToMarks(startOffset + 1);
            break;
        }
        if (current() == quote) {
            isClosed = true;
            advance();
        } else if (current() == '\\') {
            readEscape(characters);
        } else {
            characters += current();
            advance();
        }
    }
    MofToken token = tokenFrom(kind, startOffset, start);
    // Published schemas carry single bytes of other encodings in descriptions; they are no reason
    // to refuse a class.
    token.characters = utf8::clean(characters);
    return token;
}

/// A forgotten quote would swallow the marks at the end of its line, and their absence would be
/// told as further mistakes.
void MofLexer::stepBackToMarks(std::size_t firstOffset) {
    const std::string_view inside = text.substr(firstOffset, offset - firstOffset);
    const std::size_t lastOther = inside.find_last_not_of(";,)]} \t");
    const std::size_t marks = lastOther == std::string_view::npos ? 0 : lastOther + 1;
    const auto distance = static_cast<unsigned>(inside.size() - marks);
    offset -= distance;
    position.column -= distance;
}

void MofLexer::readEscape(std::string& out) {
    static constexpr std::string_view kLetters = "btnfr\"'\\";
    static constexpr std::string_view kMeanings = "\b\t\n\f\r\"'\\";
    const MofPosition start = position;
    advance();
    if (current() == 'x' || current() == 'X') {
        readHexEscape(out, start);
        return;
    }
    const std::size_t index = atEnd() ? std::string_view::npos : kLetters.find(current());
    if (index == std::string_view::npos) {
        report(start, "a backslash", "one of \\b \\t \\n \\f \\r \\\" \\' \\\\ \\x");
        return;
    }
    out += kMeanings[index];
    advance();
}

void MofLexer::readHexEscape(std::string& out, MofPosition start) {
    advance();
    char32_t code = 0;
    std::size_t digits = 0;
    for (int digit = hexDigit(current()); digit >= 0 && digits < kMaxHexDigits;
         digit = hexDigit(current())) {
        code = code * 16 + static_cast<char32_t>(digit);
        ++digits;
        advance();
    }
    if (digits == 0 || code == 0) {
        report(start, "\\x", "\\x with one to four hexadecimal digits, not 0");
        return;
    }
    utf8::append(out, code);
}

MofToken MofLexer::tokenFrom(MofTokenKind kind, std::size_t start,
                             MofPosition startPosition) const {
    MofToken token;
    token.kind = kind;
    token.text = text.substr(start, offset - start);
    token.position = startPosition;
    return token;
}

void MofLexer::report(MofPosition where, std::string_view found, std::string_view expected) {
    log.add(file, where, found, expected);
}

}  // namespace cimomd
