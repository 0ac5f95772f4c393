#pragma once

// How much of a server's answer a command holds in a form that can be shown.

#include <cstddef>

namespace sennetctl {

/// A short answer may refer to the same long text over and over, as numbers do to their names, so
/// what is made of an answer has a bound of its own.
class AnswerRoom {
  public:
    static constexpr std::size_t kMostOctets = std::size_t{128} << 20;

    /// Raises CannotRun when the answer, with these octets of memory, becomes too large.
    void take(std::size_t octets);

  private:
    std::size_t leftOctets = kMostOctets;
};

}  // namespace sennetctl
