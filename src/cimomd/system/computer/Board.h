#pragma once

// The boards of the machine, as its firmware describes them: the main board, and on large machines
// those that are plugged into it.

#include <cstdint>
#include <string>
#include <vector>

#include "system/Fact.h"
#include "system/SystemPaths.h"
#include "system/computer/SmbiosTable.h"

namespace cimomd {

struct Board {
    /// Its place among those that the firmware lists.
    std::size_t index = 0;
    Fact<std::string> manufacturer;
    Fact<std::string> model;
    Fact<std::string> version;
    Fact<std::string> serialNumber;
    Fact<std::string> assetTag;
    /// Where in the chassis the board is.
    Fact<std::string> location;
    /// Whether other parts are plugged into it.
    Fact<bool> hosting;
    Fact<bool> removable;
    Fact<bool> replaceable;
    Fact<bool> hotSwappable;
};

std::vector<Board> boardsOf(const SmbiosTable& table);

/// From the SMBIOS tables, else what the kernel hands on of them; missing when both say nothing.
Fact<std::vector<Board>> readBoards(const SystemPaths& paths);

}  // namespace cimomd
