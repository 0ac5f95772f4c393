#pragma once

// What changed in an inventory from one MIF file to the next.

#include <string>
#include <vector>

#include "mif/MifTables.h"

namespace sennetctl {

struct MifChange {
    enum class Kind { Added, Removed, Changed };

    std::string table;
    Kind kind = Kind::Changed;
    std::string row;        // what tells the row from others; empty when the change is of all rows
    std::string attribute;  // empty when the change is of a whole row or table
    std::string before;     // the value that changed
    std::string after;
};

/// The changes from the old tables to the new ones, in the order of the old ones and then of what
/// is new. Tables are the same by their class, rows by their key or, where that only counts rows,
/// by their first other attribute; rows that this does not tell apart are added or removed as a
/// whole. The order of rows and their numbers are no change.
std::vector<MifChange> differencesOf(const std::vector<MifTable>& oldTables,
                                     const std::vector<MifTable>& newTables);

}  // namespace sennetctl
