#pragma once

// The program's own output: where it goes, and whether it arrived there.

#include <ostream>
#include <string>

#include "report/DescriptorBuffer.h"
#include "report/Output.h"

namespace sennetctl {

class StandardStreams {
  public:
    /// Until its end, what is written to standard error comes behind what was written before.
    StandardStreams();
    ~StandardStreams();
    StandardStreams(const StandardStreams&) = delete;
    StandardStreams& operator=(const StandardStreams&) = delete;

    /// How commands write to them; valid as long as this object.
    Output output(bool json);

    /// Writes out what standard output still holds. Returns why something did not arrive, "standard
    /// output: reason"; an empty text when all did.
    std::string flush();

  private:
    DescriptorBuffer buffer;
    std::ostream out;
    std::ostream* usualTie;
};

}  // namespace sennetctl
