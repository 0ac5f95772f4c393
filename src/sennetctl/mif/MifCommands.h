#pragma once

// `sennetctl mif`: what stands in MIF files, and what is wrong with them.

#include <string>
#include <vector>

#include "mif/MifLint.h"
#include "report/Output.h"

namespace sennetctl {

/// Checks the files in their order, as one site that imports them one after the other. Those that
/// cannot be read are told, and the status is then kCannotRun.
int checkMifFiles(const std::vector<std::string>& files, const LintOptions& options,
                  const Output& output);

// Both of the others throw CannotRun when a file cannot be read or is no MIF file.

/// Prints the tables of a file, as JSON when the output is to be JSON.
int showMifFile(const std::string& file, const Output& output);

/// Prints what changed in the inventory from one file to the other. The status is kFindings when
/// anything did.
int compareMifFiles(const std::string& oldFile, const std::string& newFile, const Output& output);

}  // namespace sennetctl
