#pragma once

// What the reader says to a file, for tests that expect it to be readable.

#include <string>
#include <string_view>

#include "mifreader/Tolerance.h"

namespace Mif {

// Where and why the reader refuses the text, or "accepted".
std::string refusal(std::string_view text, Tolerances tolerances);

}  // namespace Mif
