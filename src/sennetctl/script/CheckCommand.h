#pragma once

// `sennetctl check`: what the generator will make of inventory scripts.

#include <string>
#include <vector>

#include "report/Output.h"

namespace sennetctl {

struct CheckOptions {
    std::vector<std::string> scripts;  // none for those that sennet reads
    bool offline = false;              // asks no server
    bool translations = false;         // tells missing names and sizes, too
    unsigned timeoutSeconds = 10;      // for the server's first answer
};

/// Prints the findings. A server that cannot be reached or does not answer is told on standard
/// error, and then only the scripts themselves are checked. Throws CannotRun when a script cannot
/// be read.
int checkScripts(const CheckOptions& options, const Output& output);

}  // namespace sennetctl
