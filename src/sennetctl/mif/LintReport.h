#pragma once

// Collects the findings in one file.

#include <string>
#include <string_view>
#include <vector>

#include "mif/LintRule.h"
#include "mifreader/Error.h"
#include "report/Finding.h"

namespace sennetctl {

/// Octets of a file as a finding names them: in UTF-8, and of a long text only the first 255
/// characters, the last of them an ellipsis.
std::string shownInFinding(std::string_view latin1);

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
