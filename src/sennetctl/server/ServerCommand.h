#pragma once

// `sennetctl server`: which CIM server the generator reaches, and why.

#include <string>
#include <vector>

#include "report/Output.h"

namespace sennetctl {

struct ServerOptions {
    /// Namespaces to look for beside the usual ones, which servers need not tell.
    std::vector<std::string> namespaces;
    bool listClasses = false;
    unsigned timeoutSeconds = 10;  ///< for the connection and for each answer
};

/// Prints the places that are tried, as soon as they are known, the namespaces with their classes,
/// and the time of a request. The status is kFindings when no server is reached, when it does not
/// answer or has not one of the namespaces asked for. Throws CannotRun when one of these is no
/// name.
int showServer(const ServerOptions& options, const Output& output);

}  // namespace sennetctl
