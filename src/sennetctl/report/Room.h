#pragma once

// How much a command holds of what others say.

#include <cstddef>
#include <string>

namespace sennetctl {

/// What is made of an answer or a file may be much longer than the answer or the file, so it has a
/// bound of its own.
class Room {
  public:
    /// @param octets   how many there are
    /// @param refusal  told to whom they are not enough
    Room(std::size_t octets, std::string refusal)
        : leftOctets(octets), refusal(std::move(refusal)) {}

    /// Raises CannotRun with the refusal when fewer octets are left.
    void take(std::size_t octets);

  private:
    std::size_t leftOctets;
    std::string refusal;
};

}  // namespace sennetctl
