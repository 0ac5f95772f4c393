#pragma once

// Texts that a maker should have filled in, and often has not.

#include <optional>
#include <string>
#include <string_view>

namespace cimomd {

/// Whether `text` only stands where a value should: a known placeholder (ignoring case and outer
/// blanks), nothing at all, or one character repeated, blanks and dashes apart ("0000", and UUIDs
/// of zeros or Fs).
bool isPlaceholder(std::string_view text);

/// The text without outer blanks; nothing when it is a placeholder.
std::optional<std::string> withoutPlaceholder(const std::optional<std::string>& text);

}  // namespace cimomd
