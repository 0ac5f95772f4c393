#pragma once

// Checks MIF files as an importing product, or the standard, sees them.

#include <cstddef>
#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "mif/LintRule.h"
#include "mifreader/Document.h"
#include "report/Finding.h"

namespace sennetctl {

struct LintOptions {
    MifProfile profile = MifProfile::Dmi;
    /// What the importing site takes, in units of 1024 octets.
    std::size_t largestKilobytes = 250;
};

class LintReport;

/// One lint sees files in the order in which the product would: it remembers their classes.
class MifLint {
  public:
    explicit MifLint(LintOptions theOptions) : options(theOptions) {}

    /// The findings in one file, in the order of their places. Where the structure is broken,
    /// nothing behind that place is looked at.
    std::vector<Finding> check(const std::string& file, std::string_view octets);

  private:
    using Names = std::vector<std::string>;

    void checkAttributesOfClass(const Mif::Group& group, LintReport& report);

    LintOptions options;
    std::map<std::string, Names> attributesByClass;
};

}  // namespace sennetctl
