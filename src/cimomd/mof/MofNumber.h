#pragma once

// The number forms of MOF (DSP0004): decimal, octal, binary and hexadecimal integers, and reals.

#include "mof/MofToken.h"

namespace cimomd {

/// Reads `token.text` as a number and sets kind (Integer or Real) and value. Empty on success, else
/// what was expected in the place of the text.
std::string_view parseMofNumber(MofToken& token);

}  // namespace cimomd
