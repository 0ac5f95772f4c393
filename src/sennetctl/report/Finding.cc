#include "report/Finding.h"

#include <algorithm>
#include <ostream>

#include "report/Json.h"
#include "report/Text.h"

namespace sennetctl {

namespace {

const char* colourOf(Severity severity) {
    switch (severity) {
        case Severity::Error:
            return "\x1B[31m";
        case Severity::Warning:
            return "\x1B[33m";
        case Severity::Note:
            break;
    }
    return "\x1B[36m";
}

std::size_t countOf(const std::vector<Finding>& findings, Severity severity) {
    return static_cast<std::size_t>(
        std::count_if(findings.begin(), findings.end(),
                      [&](const Finding& finding) { return finding.severity == severity; }));
}

void printFinding(const Finding& finding, const Output& output) {
    output.out << printable(finding.file) << ':';
    if (finding.line > 0) {
        output.out << finding.line << ':';
    }
    if (finding.column > 0) {
        output.out << finding.column << ':';
    }
    output.out << ' ';
    if (output.colour) {
        output.out << colourOf(finding.severity) << nameOf(finding.severity) << "\x1B[0m";
    } else {
        output.out << nameOf(finding.severity);
    }
    output.out << ": " << printable(finding.message) << '\n';
}

Json jsonOf(const Finding& finding) {
    Json one = Json::object();
    one["file"] = finding.file;
    one["line"] = finding.line > 0 ? Json(finding.line) : Json(nullptr);
    one["column"] = finding.column > 0 ? Json(finding.column) : Json(nullptr);
    one["severity"] = nameOf(finding.severity);
    one["message"] = finding.message;
    return one;
}

/// For people; what is as it should be needs no word.
const char* remarkOn(ServerPart server) {
    switch (server) {
        case ServerPart::NotAsked:
            return " (no server was asked)";
        case ServerPart::NotReached:
            return " (no server was reached)";
        case ServerPart::BrokeDown:
            return " (the server was not asked about all)";
        case ServerPart::NotConcerned:
        case ServerPart::Asked:
            break;
    }
    return "";
}

const char* nameOf(ServerPart server) {
    switch (server) {
        case ServerPart::NotAsked:
            return "not asked";
        case ServerPart::NotReached:
            return "not reached";
        case ServerPart::BrokeDown:
            return "broke down";
        case ServerPart::NotConcerned:
        case ServerPart::Asked:
            break;
    }
    return "asked";
}

/// Whether the findings are half the truth against the will of the caller.
bool isLost(ServerPart server) {
    return server == ServerPart::NotReached || server == ServerPart::BrokeDown;
}

}  // namespace

const char* nameOf(Severity severity) {
    switch (severity) {
        case Severity::Error:
            return "error";
        case Severity::Warning:
            return "warning";
        case Severity::Note:
            break;
    }
    return "note";
}

int printResult(const CheckResult& result, const Output& output) {
    const std::size_t errors = countOf(result.findings, Severity::Error);
    const std::size_t warnings = countOf(result.findings, Severity::Warning);
    tellFailures(result.failures, output);
    if (output.json) {
        Json document = Json::object();
        for (const auto& [name, value] : result.basis) {
            document[name] = value;
        }
        document["files"] = result.files;
        document["findings"] = Json::array();
        for (const Finding& finding : result.findings) {
            document["findings"].push_back(jsonOf(finding));
        }
        document["errors"] = errors;
        document["warnings"] = warnings;
        if (result.server != ServerPart::NotConcerned) {
            document["server"] = nameOf(result.server);
        }
        if (isLost(result.server)) {
            document["serverReason"] = result.serverReason;
        }
        addFailures(result.failures, document);
        printJson(document, output);
    } else if (!result.files.empty() || !result.findings.empty() || result.failures.empty()) {
        for (const Finding& finding : result.findings) {
            printFinding(finding, output);
        }
        output.out << counted(result.files.size(), "file") << ": " << counted(errors, "error")
                   << ", " << counted(warnings, "warning") << remarkOn(result.server) << '\n';
    }
    if (!result.failures.empty()) {
        return kCannotRun;
    }
    return errors + warnings > 0 || isLost(result.server) ? kFindings : kFine;
}

}  // namespace sennetctl
