#pragma once

// The graphics units: PCI devices of the display class, and units that the device tree describes.

#include <cstdint>
#include <string>
#include <vector>

#include "system/Fact.h"
#include "system/SystemPaths.h"

namespace cimomd {

struct VideoController {
    /// The PCI address, or the card's name such as card0.
    std::string id;
    Fact<std::uint16_t> vendor;
    Fact<std::uint16_t> device;
    Fact<std::string> vendorName;
    /// The name in pci.ids, or what the device tree says.
    Fact<std::string> processor;
    Fact<std::string> driver;
    Fact<std::uint64_t> memoryBytes;
};

/// PCI devices before others; missing when neither source can be read.
Fact<std::vector<VideoController>> readVideoControllers(const SystemPaths& paths);

}  // namespace cimomd
