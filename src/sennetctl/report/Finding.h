#pragma once

// What a command found in a file, and how it is told.

#include <string>
#include <utility>
#include <vector>

#include "report/Failure.h"
#include "report/Output.h"

namespace sennetctl {

/// A note is told but is no reason for the exit status kFindings.
enum class Severity { Note, Warning, Error };

/// "note", "warning" or "error".
const char* nameOf(Severity severity);

struct Finding {
    std::string file;
    /// Counted from 1, in lines that end at LF and in octets; 0 where there is no such place.
    unsigned line = 0;
    unsigned column = 0;
    Severity severity = Severity::Warning;
    std::string message;
};

/// What a CIM server had to do with the findings: NotConcerned where there is nothing to ask it,
/// NotAsked where nobody wanted it to be asked.
enum class ServerPart { NotConcerned, Asked, NotAsked, NotReached, BrokeDown };

/// What a check of several files comes to.
struct CheckResult {
    std::vector<Finding> findings;
    std::vector<std::string> files;  ///< that were looked at
    ServerPart server = ServerPart::NotConcerned;
    std::string serverReason;       ///< why it is NotReached or BrokeDown
    std::vector<Failure> failures;  ///< of the files that could not be looked at
    /// Members that only the JSON document has, name and value.
    std::vector<std::pair<std::string, std::string>> basis;
};

/// Tells the failures, and prints each finding as "file:line:column: severity: message" and then
/// how many there are, or all as JSON, and whether a server was asked. Returns the exit status,
/// which is kCannotRun where something failed, and kFindings also where a server should have been
/// asked and was not asked about all.
int printResult(const CheckResult& result, const Output& output);

}  // namespace sennetctl
