#pragma once

// The small texts in which the kernel and the firmware tell one fact each, and bounded listings.

#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>
#include <system_error>
#include <vector>

#include "files/BoundedFile.h"
#include "system/Fact.h"

namespace cimomd {

inline constexpr std::size_t kMaxSmallFileBytes = std::size_t{64} << 10;
/// A fourth of the processes that a kernel can number; no other directory has nearly as many.
inline constexpr std::size_t kMaxListedEntries = std::size_t{1} << 20;

/// Why there is no value when a file could not be read, or a system call failed.
Absence absenceOf(FileStatus status);
Absence absenceOf(const std::error_code& error);

/// The file's text, at most `maxBytes` long; nothing when it cannot be read whole.
Fact<std::string> readText(const std::filesystem::path& path,
                           std::size_t maxBytes = kMaxSmallFileBytes);

/// The text without white space and NUL bytes at its ends; nothing also when that is empty.
Fact<std::string> readFact(const std::filesystem::path& path);

/// A file that holds one number; nothing when it holds anything else, or a negative number.
Fact<std::uint64_t> readNumber(const std::filesystem::path& path);

/// The same, negative numbers included.
Fact<std::int64_t> readSignedNumber(const std::filesystem::path& path);

// The same of a text that was read before.
Fact<std::string> factIn(const Fact<std::string>& text);
Fact<std::uint64_t> numberIn(const Fact<std::string>& fact);
Fact<std::int64_t> signedNumberIn(const Fact<std::string>& fact);

/// The names in a directory in byte order; nothing when it cannot be read to its end, or has more
/// than `maxEntries`: what would be missing from a part of the names could not be told.
Fact<std::vector<std::string>> listDirectory(const std::filesystem::path& path,
                                             std::size_t maxEntries = kMaxListedEntries);

}  // namespace cimomd
