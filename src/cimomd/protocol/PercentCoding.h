#pragma once

// Percent coding (RFC 3986), in which CIM headers carry texts.

#include <optional>
#include <string>
#include <string_view>

namespace cimomd {

/// Letters, digits and "-._~" stay, every other byte becomes %XX.
std::string percentEncoded(std::string_view text);

/// Nothing when a "%" is not followed by two hexadecimal digits.
std::optional<std::string> percentDecoded(std::string_view text);

}  // namespace cimomd
