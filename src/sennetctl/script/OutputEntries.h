#pragma once

// The entries of velm.properties that say where the output files of each product go.

#include <string_view>
#include <vector>

#include "properties/PropertiesEntries.h"
#include "script/Places.h"

namespace sennetctl {

struct OutputEntry {
    OutputPlace place;
    Velm::PropertiesEntry entry;  ///< with an absolute path as its value
};

/// One for each of the places that the octets of the configuration have an absolute path for. A
/// general entry may stand in several of them.
std::vector<OutputEntry> outputEntriesIn(std::string_view octets);

}  // namespace sennetctl
