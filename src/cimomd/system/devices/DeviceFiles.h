#pragma once

// The kinds of files that all devices have in sysfs.

#include <cstdint>
#include <filesystem>
#include <string>
#include <string_view>

#include "system/Fact.h"

namespace cimomd {

/// A file that holds one hexadecimal number that fits Number, with "0x" or without; missing also
/// when it holds anything else.
template <typename Number>
Fact<Number> readHexNumber(const std::filesystem::path& path);

extern template Fact<std::uint8_t> readHexNumber(const std::filesystem::path& path);
extern template Fact<std::uint16_t> readHexNumber(const std::filesystem::path& path);
extern template Fact<std::uint32_t> readHexNumber(const std::filesystem::path& path);

/// A file that holds 0 or 1.
Fact<bool> readSwitch(const std::filesystem::path& path);

/// The same of a number that was read before.
Fact<bool> switchIn(const Fact<std::uint64_t>& number);

/// The value of a `key=value` line in the text of a device's uevent file.
Fact<std::string> ueventValue(std::string_view uevent, std::string_view key);

/// The same from the file in a device's directory.
Fact<std::string> readUeventValue(const std::filesystem::path& device, std::string_view key);

}  // namespace cimomd
