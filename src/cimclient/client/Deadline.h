// The point in time at which an operation is given up.

#pragma once

#include <Pegasus/Common/Config.h>

#include <chrono>

namespace Pegasus {

class Deadline {
  public:
    /// So many milliseconds from now, on a clock that nobody sets.
    explicit Deadline(Uint32 milliseconds);

    bool hasPassed() const;
    /// Whole milliseconds left, rounded up and at least 0; fits what poll(2) takes.
    int millisecondsLeft() const;

  private:
    std::chrono::steady_clock::time_point end;
};

}  // namespace Pegasus
