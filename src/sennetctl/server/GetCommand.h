#pragma once

// `sennetctl get`: the instances of a class.

#include <string>
#include <vector>

#include "report/Output.h"

namespace sennetctl {

struct GetOptions {
    std::string className;
    std::string nameSpace = "root/cimv2";
    /// In this order; none for all that have a value in some instance.
    std::vector<std::string> properties;
    unsigned timeoutSeconds = 10;  // for the server's first answer
};

/// Prints a table of the instances, numbers with names as these. The status is kFindings when there
/// are none, or when the class does not declare one of the properties. Throws CannotRun when the
/// server cannot be reached or refuses the class.
int showInstances(const GetOptions& options, const Output& output);

}  // namespace sennetctl
