// Puts texts and attributes into XML.

#pragma once

#include <Pegasus/Common/Char16.h>
#include <Pegasus/Common/String.h>

#include <cstddef>
#include <string>
#include <string_view>

namespace Pegasus {

/// Appends `text` as UTF-8, so that it may stand as character data and in attribute values: & < > "
/// ' and tab, LF and CR become references; what XML 1.0 cannot carry becomes U+FFFD.
void appendEscaped(std::string& xml, const String& text);

/// The same for text that is UTF-8 already.
void appendEscaped(std::string& xml, std::string_view utf8);

/// Appends ` name="value"`.
void appendAttribute(std::string& xml, std::string_view name, const String& value);
void appendAttribute(std::string& xml, std::string_view name, std::string_view utf8);

}  // namespace Pegasus
