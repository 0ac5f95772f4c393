#pragma once

// Texts that a maker should have filled in, and often has not.

#include <filesystem>
#include <string>
#include <string_view>

#include "system/Fact.h"

namespace cimomd {

/// Whether `text` only stands where a value should: a known placeholder (ignoring case and outer
/// blanks), nothing at all, a hexadecimal zero ("0x0"), or one character at least three times,
/// blanks and dashes apart ("0000", and UUIDs of zeros or Fs).
bool isPlaceholder(std::string_view text);

/// The text without outer blanks; a placeholder is filtered.
Fact<std::string> withoutPlaceholder(const Fact<std::string>& text);

/// The text of a file in which the kernel hands on one text of the firmware.
Fact<std::string> readFirmwareText(const std::filesystem::path& path);

}  // namespace cimomd
