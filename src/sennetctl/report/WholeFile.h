#pragma once

// Files read and written whole.

#include <cstddef>
#include <string>

#include "report/CannotRun.h"

namespace sennetctl {

/// Far more than any MIF file that a product takes, and little enough to hold what it says.
constexpr std::size_t kLargestFileOctets = std::size_t(16) << 20;

/// The text for an error number that a call has left.
std::string causeOf(int error);

/// The octets of a regular file, links followed; never waits, whatever stands at the path. Throws
/// CannotRun, "PATH: reason", when it cannot be read or is larger than the limit.
std::string readWholeFile(const std::string& path, std::size_t limitOctets = kLargestFileOctets);

/// Throws CannotRun, "PATH: exists already", when anything stands at the path.
void refuseExisting(const std::string& path);

/// Writes a file, which is seen under its name only when it is complete, and takes the place of an
/// earlier one. Throws CannotRun, "PATH: reason", and then changes nothing.
void writeWholeFile(const std::string& path, const std::string& octets);

}  // namespace sennetctl
