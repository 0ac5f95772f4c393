#pragma once

// `sennetctl new`: a first inventory script for classes of the server.

#include <string>
#include <vector>

#include "report/Output.h"
#include "script/Places.h"

namespace sennetctl {

struct NewOptions {
    std::string script;                ///< path; its name ends in .script.inv
    std::vector<std::string> classes;  ///< 1 to 10
    std::string nameSpace = "root/cimv2";
    std::string title;  ///< empty for one made of the file's name
    /// The resource properties in use; what stands there is not written again.
    std::string resources = placesInUse().resources;
    unsigned timeoutSeconds = 10;  ///< for the server's first answer
};

/// Writes the script, and beside it a file of resource properties with readable names and sizes:
/// NAME.script.inv and NAME.properties. `check` has nothing against them. Throws CannotRun when one
/// of them exists already, when the server lacks a class and when a file cannot be written; then
/// neither is left behind.
int writeNewScript(const NewOptions& options, const Output& output);

}  // namespace sennetctl
