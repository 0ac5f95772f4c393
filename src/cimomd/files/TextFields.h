#pragma once

// Taking kernel texts apart. Everything looks into the text it is given and lives as long.

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace cimomd {

/// The lines without their ends; a last line without an end counts, an empty one does not.
std::vector<std::string_view> linesOf(std::string_view text);

/// The parts between runs of blanks and tabs.
std::vector<std::string_view> fieldsOf(std::string_view line);

/// Everything between separators, empty parts too; one part when there is no separator.
std::vector<std::string_view> partsOf(std::string_view text, char separator);

/// A line `key<separator>value`, blanks around both dropped.
struct KeyValue {
    std::string_view key;
    std::string_view value;
};
std::optional<KeyValue> keyValueOf(std::string_view line, char separator);

/// Decimal digits and nothing else, within 64 bits.
std::optional<std::uint64_t> parseUnsigned(std::string_view text);

/// The same with an optional minus.
std::optional<std::int64_t> parseSigned(std::string_view text);

/// Hexadecimal digits after "0x", within 64 bits.
std::optional<std::uint64_t> parseHexadecimal(std::string_view text);

/// The same without the "0x".
std::optional<std::uint64_t> parseHexDigits(std::string_view text);

/// Turns \ooo (three octal digits, as in mount tables) into the byte meant.
std::string unescapeOctal(std::string_view text);

}  // namespace cimomd
