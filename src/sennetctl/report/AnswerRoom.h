#pragma once

// How much of a server's answer a command holds in a form that can be shown.

#include "report/Room.h"

namespace sennetctl {

/// A short answer may refer to the same long text over and over, as numbers do to their names.
class AnswerRoom : public Room {
  public:
    static constexpr std::size_t kMostOctets = std::size_t{128} << 20;

    AnswerRoom() : Room(kMostOctets, "the answer is too large to show") {}
};

}  // namespace sennetctl
