#pragma once

// Texts of foreign origin made fit for HTML.

#include <string>
#include <string_view>

namespace sennetctl {

/// Appends `text` so that it stands for itself in an element and in a quoted attribute: no markup
/// begins or ends in it. Line ends become LF, other control characters blanks, octets that are not
/// UTF-8 become U+FFFD.
void appendHtml(std::string& html, std::string_view text);

/// Appends a text as it is shown in a cell: a moment of CIM or DMI, yyyymmddHHMMSS.uuuuuu+ooo, as a
/// time that people read, anything else as by appendHtml.
void appendHtmlValue(std::string& html, std::string_view text);

}  // namespace sennetctl
