#pragma once

// `sennetctl mif`: what stands in MIF files, and what is wrong with them.

#include <string>
#include <vector>

#include "mif/MifLint.h"
#include "report/Output.h"

namespace sennetctl {

// All of these throw CannotRun when a file cannot be read; those that need to understand the file
// also when it is no MIF file.

/// Checks the files in their order, as one site that imports them one after the other.
int checkMifFiles(const std::vector<std::string>& files, const LintOptions& options,
                  const Output& output);

/// Prints the tables of a file, as JSON when the output is to be JSON.
int showMifFile(const std::string& file, const Output& output);

/// Prints what changed in the inventory from one file to the other. The status is kFindings when
/// anything did.
int compareMifFiles(const std::string& oldFile, const std::string& newFile, const Output& output);

}  // namespace sennetctl
