#pragma once

// What changed in an inventory from one MIF file to the next.

#include <cstddef>
#include <string>
#include <vector>

#include "mif/MifTables.h"

namespace sennetctl {

struct MifChange {
    enum class Kind { Added, Removed, Changed };

    std::string table;  // its name; empty for the component, of which the name may have changed
    Kind kind = Kind::Changed;
    std::string row;        // what tells the row from others; empty when the change is of all rows
    std::string attribute;  // empty when the change is of a whole row or table, or of its name
    std::string before;     // what changed: the value in the row, the definition of the attribute,
    std::string after;      // or the name
};

/// Far more than anybody reads.
constexpr std::size_t kLargestDifferencesOctets = std::size_t(64) << 20;

/// The changes from the old file to the new one, in the order of the old tables and then of what is
/// new: names, definitions of attributes (type, size and whether they are keys) and rows. Tables
/// are the same by their class, rows by their key or, where that only counts rows, by their first
/// other attribute; rows that this does not tell apart are added or removed as a whole. The order
/// of rows and their numbers are no change. Throws CannotRun when the changes, each with the row
/// and the table that it is of, take more than so many octets.
std::vector<MifChange> differencesOf(const MifContent& before, const MifContent& after,
                                     std::size_t largestOctets = kLargestDifferencesOctets);

}  // namespace sennetctl
