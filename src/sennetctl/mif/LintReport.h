#pragma once

// Collects the findings in one file.

#include <string>
#include <vector>

#include "mif/LintRule.h"
#include "mifreader/Error.h"
#include "report/Finding.h"

namespace sennetctl {

class LintReport {
  public:
    LintReport(std::string theFile, MifProfile theProfile)
        : file(std::move(theFile)), profile(theProfile) {}

    /// Adds a finding unless the profile does not mind, or there are too many for anybody to read.
    void add(LintRule rule, Mif::Position position, const std::string& message);

    /// The findings in the order of their places.
    std::vector<Finding> take();

  private:
    std::string file;
    MifProfile profile;
    std::vector<Finding> findings;
};

}  // namespace sennetctl
