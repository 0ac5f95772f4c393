// Which octets and characters XML 1.0 (fifth edition) and UTF-8 (RFC 3629) allow where.

#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace Pegasus {

/// XML's white space: blank, tab, line feed, carriage return.
constexpr bool isXmlSpace(char c) {
    return c == ' ' || c == '\t' || c == '\n' || c == '\r';
}

/// An octet that may begin a name. All octets above 127 are taken, whatever letter they belong to.
constexpr bool isNameStart(char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || c == '_' || c == ':' ||
           static_cast<unsigned char>(c) >= 0x80;
}

constexpr bool isNameCharacter(char c) {
    return isNameStart(c) || (c >= '0' && c <= '9') || c == '.' || c == '-';
}

/// `text` without white space at either end.
std::string_view trimXmlSpace(std::string_view text);

/// Compares two texts, taking ASCII letters of either case for the same.
bool equalsIgnoringCase(std::string_view a, std::string_view b);

/// True when `text` is white space only, or empty.
bool isBlank(std::string_view text);

/// What the front part of a sequence of octets turned out to be.
struct OctetCheck {
    enum class Verdict { Good, Incomplete, InvalidUtf8, ForbiddenCharacter };
    /// So many octets at the front are whole, allowed characters.
    std::size_t goodSize;
    /// What stands there: nothing, the beginning of a character that needs more octets, or a fault.
    Verdict verdict;
};

/// Checks that `octets` are UTF-8 without the characters that XML refuses in raw form: controls
/// other than tab, LF and CR, U+FFFE and U+FFFF.
OctetCheck checkOctets(std::string_view octets);

/// Whether a character reference to `code` is taken. Wider than XML 1.0: references to the control
/// characters 1 to 31 are in use between CIM peers. Refused are 0, surrogates, U+FFFE, U+FFFF, and
/// what is above U+10FFFF.
constexpr bool isReferable(std::uint32_t code) {
    return code != 0 && code <= 0x10FFFF && !(code >= 0xD800 && code <= 0xDFFF) && code != 0xFFFE &&
           code != 0xFFFF;
}

/// `text` between double quotes for a message: cut after 60 octets at a character's border, control
/// characters as "?".
std::string quotedForMessage(std::string_view text);

}  // namespace Pegasus
