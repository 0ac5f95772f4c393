#include "mif/LintReport.h"

#include <algorithm>
#include <tuple>

#include "report/Text.h"

namespace sennetctl {

namespace {

constexpr std::size_t kMostFindings = 1000;

constexpr std::size_t kLongestShown = 255;

}  // namespace

std::string shownInFinding(std::string_view latin1) {
    return shortened(fromLatin1(latin1.substr(0, kLongestShown + 1)), kLongestShown);
}

void LintReport::add(LintRule rule, Mif::Position position, const std::string& message) {
    const std::optional<Severity> severity = severityOf(rule, profile);
    if (!severity || findings.size() > kMostFindings) {
        return;
    }
    if (findings.size() == kMostFindings) {
        findings.push_back({file, position.line, position.column, Severity::Note,
                            "there are more findings, which are not told"});
        return;
    }
    findings.push_back({file, position.line, position.column, *severity, message});
}

std::vector<Finding> LintReport::take() {
    std::stable_sort(findings.begin(), findings.end(),
                     [](const Finding& one, const Finding& other) {
                         return std::tie(one.line, one.column) < std::tie(other.line, other.column);
                     });
    return std::move(findings);
}

}  // namespace sennetctl
