#include "files/TextFields.h"

#include <algorithm>
#include <charconv>

#include "text/Utf8.h"

namespace cimomd {
namespace {

template <typename Number>
std::optional<Number> parseNumber(std::string_view text, int base) {
    Number number{};
    const char* end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, number, base);
    if (text.empty() || error != std::errc() || stop != end)
        return std::nullopt;
    return number;
}

bool isOctal(char c) {
    return c >= '0' && c <= '7';
}

}  // namespace

std::vector<std::string_view> linesOf(std::string_view text) {
    std::vector<std::string_view> lines;
    while (!text.empty()) {
        const std::size_t end = text.find('\n');
        lines.push_back(text.substr(0, end));
        text.remove_prefix(end == std::string_view::npos ? text.size() : end + 1);
    }
    return lines;
}

std::vector<std::string_view> fieldsOf(std::string_view line) {
    static constexpr std::string_view kBlanks = " \t";
    std::vector<std::string_view> fields;
    std::size_t start = line.find_first_not_of(kBlanks);
    while (start != std::string_view::npos) {
        const std::size_t end = line.find_first_of(kBlanks, start);
        fields.push_back(line.substr(start, end - start));
        start = line.find_first_not_of(kBlanks, end);
    }
    return fields;
}

std::vector<std::string_view> partsOf(std::string_view text, char separator) {
    std::vector<std::string_view> parts;
    parts.reserve(static_cast<std::size_t>(std::count(text.begin(), text.end(), separator)) + 1);
    std::size_t start = 0;
    for (std::size_t end = text.find(separator); end != std::string_view::npos;
         end = text.find(separator, start)) {
        parts.push_back(text.substr(start, end - start));
        start = end + 1;
    }
    parts.push_back(text.substr(start));
    return parts;
}

std::optional<KeyValue> keyValueOf(std::string_view line, char separator) {
    const std::size_t place = line.find(separator);
    if (place == std::string_view::npos)
        return std::nullopt;
    return KeyValue{trimmed(line.substr(0, place)), trimmed(line.substr(place + 1))};
}

std::optional<std::uint64_t> parseUnsigned(std::string_view text) {
    return parseNumber<std::uint64_t>(text, 10);
}

std::optional<std::int64_t> parseSigned(std::string_view text) {
    return parseNumber<std::int64_t>(text, 10);
}

std::optional<std::uint64_t> parseHexadecimal(std::string_view text) {
    if (text.substr(0, 2) != "0x")
        return std::nullopt;
    return parseHexDigits(text.substr(2));
}

std::optional<std::uint64_t> parseHexDigits(std::string_view text) {
    return parseNumber<std::uint64_t>(text, 16);
}

std::string unescapeOctal(std::string_view text) {
    std::string out;
    out.reserve(text.size());
    for (std::size_t i = 0; i < text.size(); ++i) {
        const bool isEscape = text[i] == '\\' && i + 3 < text.size() && isOctal(text[i + 1]) &&
                              isOctal(text[i + 2]) && isOctal(text[i + 3]);
        if (!isEscape) {
            out += text[i];
            continue;
        }
        const int code = (text[i + 1] - '0') * 64 + (text[i + 2] - '0') * 8 + (text[i + 3] - '0');
        out += static_cast<char>(code);
        i += 3;
    }
    return out;
}

}  // namespace cimomd
