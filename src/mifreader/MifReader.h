#pragma once

// Reads Management Information Format files, and refuses what is not one to the letter. Checked
// are the structure, the Ids and keys, every value against the type of its attribute, the width of
// rows against their group, and that groups of one class are alike.

#include <string_view>

#include "mifreader/Document.h"
#include "mifreader/Tolerance.h"

namespace Mif {

class MifReader {
  public:
    // Reads to the letter but for the tolerances.
    explicit MifReader(Tolerances theTolerances = {}) : tolerances(theTolerances) {}

    // The component of a whole file, given as octets. Throws Error at the first thing wrong.
    // Time and memory grow with the length of the text; more than 4,194,304 values in rows, where
    // that is most, are refused.
    Component read(std::string_view text) const;

  private:
    Tolerances tolerances;
};

}  // namespace Mif
