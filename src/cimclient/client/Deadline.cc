#include "client/Deadline.h"

#include <algorithm>
#include <limits>

namespace Pegasus {

using std::chrono::milliseconds;
using std::chrono::steady_clock;

Deadline::Deadline(Uint32 milliseconds)
    : end(steady_clock::now() + std::chrono::milliseconds(milliseconds)) {}

bool Deadline::hasPassed() const {
    return steady_clock::now() >= end;
}

int Deadline::millisecondsLeft() const {
    const auto left = std::chrono::ceil<milliseconds>(end - steady_clock::now()).count();
    return static_cast<int>(std::clamp<decltype(left)>(left, 0, std::numeric_limits<int>::max()));
}

}  // namespace Pegasus
