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
};

/// Prints the places that are tried, the namespaces with their classes, and the time of a request.
/// The status is kFindings when no server is reached.
int showServer(const ServerOptions& options, const Output& output);

}  // namespace sennetctl
