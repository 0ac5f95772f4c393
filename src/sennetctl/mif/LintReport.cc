#include "mif/LintReport.h"

#include <algorithm>
#include <tuple>

namespace sennetctl {

std::vector<Finding> LintReport::take() {
    std::stable_sort(findings.begin(), findings.end(),
                     [](const Finding& one, const Finding& other) {
                         return std::tie(one.line, one.column) < std::tie(other.line, other.column);
                     });
    return std::move(findings);
}

}  // namespace sennetctl
