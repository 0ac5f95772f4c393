#pragma once

// Texts of foreign origin made fit for a terminal.

#include <cstddef>
#include <string>
#include <string_view>

namespace sennetctl {

/// The text in one line and harmless for a terminal: control characters become blanks, octets that
/// are not UTF-8 become U+FFFD.
std::string printable(std::string_view text);

/// Characters of a UTF-8 text.
std::size_t widthOf(std::string_view text);

/// At most `width` characters of a text that `printable` returned; where it is cut, the last of
/// them is an ellipsis.
std::string shortened(std::string_view text, std::size_t width);

/// Octets of ISO 8859-1 in UTF-8.
std::string fromLatin1(std::string_view octets);

/// "1 row", "2 rows", "0 rows".
std::string counted(std::size_t count, std::string_view noun);

}  // namespace sennetctl
