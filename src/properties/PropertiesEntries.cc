#include "properties/PropertiesEntries.h"

#include <cstdint>
#include <optional>
#include <string>
#include <utility>

#include "utf8/Utf8.h"

namespace Velm {

namespace {

constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";
constexpr std::size_t kHexDigits = 4;

bool isBlank(char c) {
    return c == ' ' || c == '\t';
}

bool isSeparator(char c) {
    return c == '=' || c == ':';
}

std::string_view withoutLeadingBlanks(std::string_view text) {
    std::size_t count = 0;
    while (count < text.size() && isBlank(text[count])) {
        ++count;
    }
    return text.substr(count);
}

std::size_t trailingBackslashes(std::string_view text) {
    std::size_t count = 0;
    while (count < text.size() && text[text.size() - 1 - count] == '\\') {
        ++count;
    }
    return count;
}

// The last blank stays when a backslash escapes it.
std::string_view withoutTrailingBlanks(std::string_view text) {
    std::size_t length = text.size();
    while (length > 0 && isBlank(text[length - 1])) {
        --length;
    }
    const bool escaped = trailingBackslashes(text.substr(0, length)) % 2 == 1;
    return text.substr(0, escaped && length < text.size() ? length + 1 : length);
}

bool isContinued(std::string_view line) {
    return trailingBackslashes(line) % 2 == 1;
}

bool isCommentOrEmpty(std::string_view unindentedLine) {
    return unindentedLine.empty() || unindentedLine[0] == '#' || unindentedLine[0] == '!';
}

std::size_t findSeparator(std::string_view line) {
    std::size_t i = 0;
    while (i < line.size() && !isSeparator(line[i])) {
        i += line[i] == '\\' ? 2 : 1;
    }
    return i < line.size() ? i : std::string_view::npos;
}

int hexValue(char c) {
    if (c >= '0' && c <= '9') {
        return c - '0';
    }
    if (c >= 'a' && c <= 'f') {
        return c - 'a' + 10;
    }
    return c >= 'A' && c <= 'F' ? c - 'A' + 10 : -1;
}

// The code unit of a `\uXXXX` at the start of the text.
std::optional<char32_t> codeUnit(std::string_view text) {
    if (text.size() < 2 + kHexDigits || text[0] != '\\' || text[1] != 'u') {
        return std::nullopt;
    }
    char32_t unit = 0;
    for (const char c : text.substr(2, kHexDigits)) {
        const int value = hexValue(c);
        if (value < 0) {
            return std::nullopt;
        }
        unit = unit * 16 + static_cast<char32_t>(value);
    }
    return unit;
}

// Both return how many bytes of the text, which starts with a backslash, they have decoded.
std::size_t appendUnicodeEscape(std::string& out, std::string_view text, char32_t unit) {
    constexpr std::size_t kLength = 2 + kHexDigits;
    if (utf8::isHighSurrogate(unit)) {
        const std::optional<char32_t> low = codeUnit(text.substr(kLength));
        if (low && utf8::isLowSurrogate(*low)) {
            utf8::append(out, utf8::joinSurrogates(unit, *low));
            return 2 * kLength;
        }
    }
    utf8::append(out, unit);
    return kLength;
}

std::size_t appendEscape(std::string& out, std::string_view text) {
    if (const std::optional<char32_t> unit = codeUnit(text)) {
        return appendUnicodeEscape(out, text, *unit);
    }
    const char next = text.size() > 1 ? text[1] : '\0';
    if (next == 't') {
        out += '\t';
    } else if (next == 'n') {
        out += '\n';
    } else if (next == 'r') {
        out += '\r';
    } else if (next == '\\' || isBlank(next) || isSeparator(next)) {
        out += next;
    } else {
        out += '\\';
        return 1;
    }
    return 2;
}

std::string decode(std::string_view text) {
    std::string out;
    out.reserve(text.size());
    while (!text.empty()) {
        const std::size_t plain = text.find('\\');
        out.append(text.substr(0, plain));
        text.remove_prefix(plain == std::string_view::npos ? text.size() : plain);
        if (!text.empty()) {
            text.remove_prefix(appendEscape(out, text));
        }
    }
    return out;
}

}  // namespace

PropertiesEntries::PropertiesEntries(std::string_view text) : text(text) {
    if (text.substr(0, kByteOrderMark.size()) == kByteOrderMark) {
        position = kByteOrderMark.size();
    }
}

std::optional<PropertiesEntry> PropertiesEntries::next() {
    while (!atEnd()) {
        const std::string_view line = takeContinuedLine();
        if (!line.empty()) {
            return entryOf(line);
        }
    }
    return std::nullopt;
}

PropertiesEntry PropertiesEntries::entryOf(std::string_view line) const {
    const std::size_t separator = findSeparator(line);
    PropertiesEntry entry;
    entry.key = decode(withoutTrailingBlanks(line.substr(0, separator)));
    entry.line = firstLine.number;
    entry.keyColumn = firstLine.column;
    entry.valueColumn = firstLine.column;
    entry.hasSeparator = separator != std::string_view::npos;
    if (entry.hasSeparator) {
        const std::string_view value = withoutLeadingBlanks(line.substr(separator + 1));
        entry.value = decode(value);
        const std::size_t begin = line.size() - value.size();
        entry.valueColumn += begin < firstLine.valuesEnd ? static_cast<unsigned>(begin) : 0;
    }
    return entry;
}

std::string_view PropertiesEntries::takeLine() {
    const std::size_t start = position;
    const std::size_t found = text.find_first_of("\r\n", start);
    const std::size_t lineEnd = found == std::string_view::npos ? text.size() : found;
    position = lineEnd + 1;
    if (text.substr(lineEnd, 2) == "\r\n") {
        ++position;
    }
    ++lineNumber;
    return withoutLeadingBlanks(text.substr(start, lineEnd - start));
}

// A line with those that continue it, without leading blanks; empty for a comment.
std::string_view PropertiesEntries::takeContinuedLine() {
    const std::size_t start = lineNumber == 0 ? 0 : position;
    std::string_view line = takeLine();
    if (isCommentOrEmpty(line)) {
        return {};
    }
    const auto column = static_cast<unsigned>(line.data() - text.data() - start) + 1;
    if (!isContinued(line)) {
        firstLine = {lineNumber, column, line.size() + 1};
        return line;
    }
    firstLine = {lineNumber, column, line.size() - 1};
    joined.clear();
    while (isContinued(line)) {
        joined.append(line.substr(0, line.size() - 1));
        line = atEnd() ? std::string_view() : takeLine();
    }
    joined.append(line);
    return joined;
}

std::map<std::string, PropertiesEntry> lastEntriesIn(std::string_view text) {
    std::map<std::string, PropertiesEntry> last;
    PropertiesEntries entries(text);
    while (std::optional<PropertiesEntry> entry = entries.next()) {
        const std::string key = entry->key;
        last.insert_or_assign(key, std::move(*entry));
    }
    return last;
}

}  // namespace Velm
