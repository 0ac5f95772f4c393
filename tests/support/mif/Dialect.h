#pragma once

// Where the files of each product leave the grammar whatever the inventory holds. What single
// classes add to that is for the tests of these files to name.

#include "mifreader/Tolerance.h"

namespace Mif {

inline const Tolerances kSmsDialect = {Tolerance::RawLineEnds};
inline const Tolerances kLanDeskDialect = {Tolerance::RawLineEnds, Tolerance::IntegersAsText};
inline const Tolerances kCaDialect = {Tolerance::RawLineEnds, Tolerance::PlainBackslashes};
inline const Tolerances kQveDialect = {Tolerance::RawLineEnds};

}  // namespace Mif
