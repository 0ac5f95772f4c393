#pragma once

// A table of a MIF file arranged for people: what says nothing about the machine is left out.

#include <string>
#include <vector>

#include "mif/MifTables.h"

namespace sennetctl {

struct ShownColumn {
    std::string name;
    std::string description;
    bool isNumber = false;  // each value is a number or missing
};

struct ShownTable {
    std::string name;
    std::string className;
    std::string description;
    std::vector<ShownColumn> columns;
    std::vector<std::vector<std::string>> rows;  // as many texts as there are columns
    std::vector<std::string> emptyColumns;       // names of those that have no value in any row
};

/// Rows come in the order of their row numbers, which are left out as columns without a value are.
/// The date that the generator writes where there is none is no value. What has no name gets a
/// word. All texts are UTF-8.
ShownTable shownTable(const MifTable& table);

}  // namespace sennetctl
