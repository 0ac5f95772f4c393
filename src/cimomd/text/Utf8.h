#pragma once

// UTF-8 for texts of doubtful origin: kernel files, firmware tables, foreign MOF files.

#include <string>
#include <string_view>

namespace cimomd {

/// Appends one character. Surrogates and codes above U+10FFFF are written as U+FFFD.
void appendUtf8(std::string& out, char32_t code);

/// `bytes` with U+FFFD in place of every byte that is not part of well-formed UTF-8 (overlong forms
/// and coded surrogates included). Well-formed text comes back unchanged.
std::string cleanUtf8(std::string_view bytes);

/// cleanUtf8, and control characters other than tab, LF and CR become U+FFFD as well: what
/// CIM-XML can carry.
std::string cleanText(std::string_view bytes);

/// At most `maxCharacters` characters from the front of well-formed UTF-8, counted in UTF-16 units
/// as MaxLen counts them.
std::string_view firstCharacters(std::string_view utf8, std::size_t maxCharacters);

/// Compares ASCII letters without case, other bytes exactly.
bool equalsIgnoringCase(std::string_view a, std::string_view b);

/// `text` with its ASCII letters in lower case.
std::string lowerCase(std::string_view text);

/// `text` without the ASCII white space (and NUL bytes) at both ends.
std::string_view trimmed(std::string_view text);

}  // namespace cimomd
