#pragma once

// Why a command could not do its work, or not all of it.

#include <string>
#include <vector>

#include "report/Json.h"
#include "report/Output.h"

namespace sennetctl {

struct Failure {
    std::string file;  ///< empty where it is none of a file
    /// Counted from 1; 0 where there is no such place.
    unsigned line = 0;
    unsigned column = 0;
    std::string reason;
};

/// "file:line:column: reason", without what is not known.
std::string textOf(const Failure& failure);

/// The reason and what is known of its place, for programs.
Json jsonOf(const Failure& failure);

/// Tells the failure on standard error, as "sennetctl: file:line:column: reason".
void tellFailure(const Failure& failure, const Output& output);

/// Tells the failure, and prints it as the member "error" of a document where JSON is wanted.
void printFailure(const Failure& failure, const Output& output);

/// Tells the failures of some of a command's files, and adds them to its document: the first as
/// "error", as with a command that did nothing, and all as "failures". Without any, does nothing.
void tellFailures(const std::vector<Failure>& failures, const Output& output);
void addFailures(const std::vector<Failure>& failures, Json& document);

}  // namespace sennetctl
