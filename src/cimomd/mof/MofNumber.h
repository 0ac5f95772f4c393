#pragma once

// The number forms of MOF (DSP0004): decimal, octal, binary and hexadecimal integers, and reals.

#include "mof/MofToken.h"

namespace cimomd {

/// Reads `token.text` as a number and sets kind (Integer or Real) and value. False when the text
/// is no number, or an integer of more than 64 bits, or a real beyond the range of a double.
bool parseMofNumber(MofToken& token);

}  // namespace cimomd
