#include "mof/MofLexer.h"

#include <fmt/format.h>

#include <algorithm>

#include "mof/MofNumber.h"
#include "text/Utf8.h"
#include "utf8/Utf8.h"

namespace cimomd {
namespace {

constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";
constexpr std::string_view kNoBreakSpace = "\xC2\xA0";
constexpr std::string_view kPunctuation = "[]{}(),;:=";
/// What may follow a text.
constexpr std::string_view kClosingMarks = ";,)]}";
constexpr std::size_t kMaxHexDigits = 4;

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

bool isNameStart(char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || c == '_' ||
           static_cast<unsigned char>(c) >= 0x80;
}

bool isBlank(char c) {
    return c == ' ' || c == '\t' || c == '\r' || c == '\n' || c == '\f' || c == '\v';
}

bool isControl(char c) {
    return static_cast<unsigned char>(c) < 0x20 && c != '\t';
}

/// The no-break space at the front of `rest`, in UTF-8 or as the single byte of Latin-1.
std::size_t noBreakSpaceLength(std::string_view rest) {
    if (rest.substr(0, kNoBreakSpace.size()) == kNoBreakSpace)
        return kNoBreakSpace.size();
    return !rest.empty() && rest.front() == kNoBreakSpace.back() ? 1 : 0;
}

/// Editors of old end a file with the byte 0x1A, and some fill up what is behind it.
std::string_view withoutEndMark(std::string_view text) {
    static constexpr std::string_view kFilling("\x1A\0 \t\r\n", 6);
    const std::size_t last = text.find_last_not_of(kFilling);
    const std::size_t mark = text.find('\x1A', last == std::string_view::npos ? 0 : last);
    return text.substr(0, mark);
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
    : text(withoutEndMark(mofText)), file(fileName), log(errorLog) {
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

void MofLexer::advanceBy(std::size_t bytes) {
    for (std::size_t i = 0; i < bytes; ++i)
        advance();
}

std::size_t MofLexer::blankLength() const {
    return isBlank(current()) ? 1 : noBreakSpaceLength(text.substr(offset));
}

/// The length of the character here when names may have it, else 0.
std::size_t MofLexer::nameCharacterLength() const {
    if (atEnd() || (!isNameStart(current()) && !isDigit(current())))
        return 0;
    const std::string_view rest = text.substr(offset);
    if (noBreakSpaceLength(rest) != 0)
        return 0;
    return std::max<std::size_t>(1, utf8::characterLength(rest));
}

void MofLexer::skipLine() {
    while (!atEnd() && current() != '\n' && current() != '\r')
        advance();
}

void MofLexer::skipBlanksAndComments() {
    while (!atEnd()) {
        if (const std::size_t length = blankLength(); length != 0) {
            advanceBy(length);
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
    report(start, "a comment without an end", "'*/'");
}

MofToken MofLexer::identifier() {
    const MofPosition start = position;
    const std::size_t startOffset = offset;
    while (const std::size_t length = nameCharacterLength())
        advanceBy(length);
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
        const std::size_t length = c == '.' || exponentSign ? 1 : nameCharacterLength();
        if (length == 0)
            break;
        advanceBy(length);
    }
    MofToken token = tokenFrom(MofTokenKind::Integer, startOffset, start);
    if (const std::string_view expected = parseMofNumber(token); !expected.empty()) {
        report(start, quotedText(token.text), expected);
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
    report(start, quotedText(word), "'#pragma'");
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
            reportBrokenText(start, "a text without an end", quote);
            break;
        }
        const char c = current();
        if (c == '\n' || c == '\r') {
            reportBrokenText(position, "the end of the line", quote);
            if (!continuesOnNextLine(quote)) {
                stepBackToMarks(startOffset + 1);
                break;
            }
            skipToMark(quote);
        } else if (c == quote) {
            isClosed = true;
            advance();
        } else if (c == '\\') {
            readEscape(characters);
        } else {
            // Nobody means these, and no answer could carry them.
            characters += isControl(c) ? utf8::kReplacement : text.substr(offset, 1);
            advance();
        }
    }
    MofToken token = tokenFrom(kind, startOffset, start);
    // Published schemas carry single bytes of other encodings in descriptions; they are no reason
    // to refuse a class.
    token.characters = utf8::clean(characters);
    return token;
}

void MofLexer::reportBrokenText(MofPosition where, std::string_view found, char quote) {
    if (!hasBrokenText)
        report(where, found, fmt::format("a closing {}", quote));
    hasBrokenText = true;
}

/// At the end of a line: whether the text was broken over lines rather than its quote forgotten.
/// The next quote ends it then, and marks or another text follow.
bool MofLexer::continuesOnNextLine(char quote) const {
    const std::string_view rest = text.substr(offset);
    const std::size_t end = rest.find(quote);
    if (end == std::string_view::npos)
        return false;
    const std::string_view between = rest.substr(0, end);
    if (between.find_first_not_of(" \t\r\n") == std::string_view::npos)
        return false;
    const std::size_t next = rest.find_first_not_of(" \t\r\n", end + 1);
    if (next == std::string_view::npos)
        return false;
    const bool isNextText = rest[next] == quote && next != end + 1;
    return isNextText || kClosingMarks.find(rest[next]) != std::string_view::npos;
}

void MofLexer::skipToMark(char mark) {
    while (!atEnd() && current() != mark)
        advance();
}

/// A forgotten quote would swallow the marks at the end of its line, and their absence would be
/// told as further mistakes.
void MofLexer::stepBackToMarks(std::size_t firstOffset) {
    const std::string_view inside = text.substr(firstOffset, offset - firstOffset);
    const std::size_t lastOther = inside.find_last_not_of(fmt::format("{} \t", kClosingMarks));
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
    const std::optional<char32_t> code = readHexDigits();
    if (!code)
        report(start, "'\\x'", "\\x with one to four hexadecimal digits, not 0");
    else
        utf8::append(out, utf8::isHighSurrogate(*code) ? joinedWithNextEscape(*code) : *code);
}

/// Characters beyond U+FFFF are written as two escapes, the halves of UTF-16. Passes the second
/// when it is one.
char32_t MofLexer::joinedWithNextEscape(char32_t high) {
    const std::size_t highEnd = offset;
    const MofPosition highEndPosition = position;
    if (current() == '\\' && (peek(1) == 'x' || peek(1) == 'X')) {
        advance();
        const std::optional<char32_t> low = readHexDigits();
        if (low && utf8::isLowSurrogate(*low))
            return utf8::joinSurrogates(high, *low);
    }
    offset = highEnd;
    position = highEndPosition;
    return high;
}

/// Passes the x and the digits behind it. Nothing when there are none, or for 0.
std::optional<char32_t> MofLexer::readHexDigits() {
    advance();
    char32_t code = 0;
    std::size_t digits = 0;
    for (int digit = hexDigit(current()); digit >= 0 && digits < kMaxHexDigits;
         digit = hexDigit(current())) {
        code = code * 16 + static_cast<char32_t>(digit);
        ++digits;
        advance();
    }
    return code == 0 ? std::nullopt : std::optional(code);
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
