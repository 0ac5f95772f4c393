#pragma once

// The tables of a MIF file as an importing product would keep them.

#include <cstddef>
#include <cstdint>
#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "mifreader/Document.h"

namespace sennetctl {

struct MifColumn {
    std::string name;  // in UTF-8, and no two of a table are alike
    Mif::Type type;
    bool isKey = false;
    std::string description;                         // in UTF-8
    std::map<std::int64_t, std::string> valueNames;  // of an enumeration, in UTF-8
};

struct MifTable {
    std::string name;       // in UTF-8
    std::string className;  // in UTF-8
    std::vector<MifColumn> columns;
    std::vector<std::vector<Mif::Value>> rows;  // as many values as there are columns
    std::string description;                    // in UTF-8
};

/// What a MIF file holds.
struct MifContent {
    std::string component;  // its name, in UTF-8
    /// One table per class: the rows of its tables and of its groups that are instances
    /// themselves, in the order of the file.
    std::vector<MifTable> tables;
};

/// What tables may take: far more than any file has that a product takes.
constexpr std::size_t kLargestTablesOctets = std::size_t(128) << 20;

/// Reads a file with everything tolerated that leaves a meaning. Throws CannotRun,
/// "PATH:line:column: reason", when there is none, "PATH: reason" when its tables take more than
/// kLargestTablesOctets, and as readWholeFile does.
MifContent readMifFile(const std::string& path);

/// The same of the octets of a file, whose path is for messages. Of a value counts what it takes
/// here, its text or the name of its number in the longest form that a command writes, and the name
/// of its column, so that what is made of the tables has a bound with them.
MifContent mifContentOf(const std::string& path, std::string_view octets,
                        std::size_t largestOctets = kLargestTablesOctets);

/// As a MIF file writes it, in the standard's letters: "Integer", "String(8)".
std::string shownType(const Mif::Type& type);

/// Whether this is the row number that the generator puts first; it says nothing about the machine.
bool isRowNumber(const MifColumn& column);

/// The value for people, in UTF-8; empty when there is none.
std::string shownValue(const Mif::Value& value);

/// The same; a number that has a name in the column is shown by it.
std::string shownValue(const Mif::Value& value, const MifColumn& column);

}  // namespace sennetctl
