#pragma once

// `sennetctl check`: what the generator will make of inventory scripts.

#include <string>
#include <vector>

#include "report/Output.h"
#include "script/Places.h"

namespace sennetctl {

struct CheckOptions {
    std::vector<std::string> scripts;  // none for those that sennet reads
    bool offline = false;              // asks no server
    bool translations = false;         // tells missing names and sizes, too
    unsigned timeoutSeconds = 10;      // for the server's first answer
    bool verbose = false;              // tells the places, too
    Places places = placesInUse();
};

/// Prints the findings, those about the configuration and the resource properties first. A server
/// that cannot be reached or does not answer is told on standard error, and then only the scripts
/// themselves are checked. Returns the exit status, which is kCannotRun where some script was not
/// read, and kFindings also where the server should have been asked and was lost.
int checkScripts(const CheckOptions& options, const Output& output);

}  // namespace sennetctl
