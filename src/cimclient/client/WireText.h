// Text between HTTP header fields and this library: octets that anybody may have sent.

#pragma once

#include <Pegasus/Common/String.h>

#include <string>
#include <string_view>

namespace Pegasus {

/// The octets as text that is safe to print: control characters become blanks and, when the whole
/// is not UTF-8, every octet above 127 becomes a question mark. Never throws for its content.
String printableText(std::string_view octets);

/// Percent-encoded (RFC 3986): all but letters, digits, "-", ".", "_" and "~".
std::string percentEncoded(std::string_view octets);

/// The reverse. A percent sign without two hexadecimal digits stands for itself.
std::string percentDecoded(std::string_view text);

/// Compares ASCII letters in any case, whatever the locale.
bool equalIgnoringCase(std::string_view a, std::string_view b);

/// Without blanks and tabs at both ends.
std::string_view trimmed(std::string_view text);

}  // namespace Pegasus
