#pragma once

// The program's own output: where it goes, and whether it arrived there.

#include <ostream>
#include <string>

#include "report/DescriptorBuffer.h"
#include "report/Output.h"

namespace sennetctl {

class StandardStreams {
  public:
    StandardStreams();

    /// How commands write to them; valid as long as this object.
    Output output(bool json);

    /// Writes out what standard output still holds. Returns why something did not arrive, "standard
    /// output: reason"; an empty text when all did.
    std::string flush();

  private:
    DescriptorBuffer buffer;
    std::ostream out;
};

}  // namespace sennetctl
