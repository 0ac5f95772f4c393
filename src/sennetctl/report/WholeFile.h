#pragma once

// Files read whole, within bounds.

#include <cstddef>
#include <stdexcept>
#include <string>

namespace sennetctl {

/// A command cannot do its work; the message is for people and names the file or the server.
class CannotRun : public std::runtime_error {
  public:
    using std::runtime_error::runtime_error;
};

/// Far more than any MIF file that a product takes, and little enough to hold what it says.
constexpr std::size_t kLargestFileOctets = std::size_t(16) << 20;

/// The octets of a regular file, links followed. Throws CannotRun, "PATH: reason", when it cannot
/// be read or is larger than the limit.
std::string readWholeFile(const std::string& path, std::size_t limitOctets = kLargestFileOctets);

}  // namespace sennetctl
