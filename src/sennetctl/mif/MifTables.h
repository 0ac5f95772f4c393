#pragma once

// The tables of a MIF file as an importing product would keep them.

#include <cstddef>
#include <string>
#include <vector>

#include "mifreader/Document.h"

namespace sennetctl {

struct MifColumn {
    std::string name;  // in UTF-8, and no two of a table are alike
    Mif::Type type;
    bool isKey = false;
};

struct MifTable {
    std::string name;       // in UTF-8
    std::string className;  // in UTF-8
    std::vector<MifColumn> columns;
    std::vector<std::vector<Mif::Value>> rows;  // as many values as there are columns
};

/// One table per class: the rows of its tables and of its groups that are instances themselves, in
/// the order of the file.
std::vector<MifTable> tablesOf(const Mif::Component& component);

/// The component of a file with everything tolerated that leaves a meaning. Throws CannotRun,
/// "PATH:line:column: reason", when there is none, and as readWholeFile does.
Mif::Component readMifFile(const std::string& path);

/// The value for people, in UTF-8; empty when there is none.
std::string shownValue(const Mif::Value& value);

}  // namespace sennetctl
