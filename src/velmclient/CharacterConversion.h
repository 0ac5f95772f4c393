// Conversion of text into UTF-8.
#pragma once

#include <string>
#include <string_view>

namespace Velm {

// The name of the character set of the environment's locale (LC_ALL, LC_CTYPE, LANG); that of the
// C locale when the environment names a locale that is not installed.
std::string localeCharset();

// The text, given in a character set of iconv(3), in UTF-8. Bytes that cannot be converted, and all
// of them when the character set is unknown, are kept as they are.
std::string toUtf8(std::string_view text, const std::string& charset);

}  // namespace Velm
