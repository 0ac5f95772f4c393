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
        case ServerPart::BrokeDown:
            return "broke down";
        case ServerPart::NotConcerned:
        case ServerPart::Asked:
            break;
    }
    return "asked";
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

int printFindings(const std::vector<Finding>& findings, const std::vector<std::string>& files,
                  const Output& output, ServerPart server,
                  const std::vector<std::pair<std::string, std::string>>& basis) {
    const std::size_t errors = countOf(findings, Severity::Error);
    const std::size_t warnings = countOf(findings, Severity::Warning);
    if (output.json) {
        Json document = Json::object();
        for (const auto& [name, value] : basis) {
            document[name] = value;
        }
        document["files"] = files;
        document["findings"] = Json::array();
        for (const Finding& finding : findings) {
            document["findings"].push_back(jsonOf(finding));
        }
        document["errors"] = errors;
        document["warnings"] = warnings;
        if (server != ServerPart::NotConcerned) {
            document["server"] = nameOf(server);
        }
        printJson(document, output);
    } else {
        for (const Finding& finding : findings) {
            printFinding(finding, output);
        }
        output.out << counted(files.size(), "file") << ": " << counted(errors, "error") << ", "
                   << counted(warnings, "warning") << remarkOn(server) << '\n';
    }
    return errors + warnings > 0 ? kFindings : kFine;
}

}  // namespace sennetctl
