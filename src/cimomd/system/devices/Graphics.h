#pragma once

// /sys/class/drm: connectors with the monitors on them, and graphics cards that are on no PCI bus.

#include <filesystem>
#include <string>
#include <vector>

#include "system/Fact.h"
#include "system/devices/Edid.h"

namespace cimomd {

struct Monitor {
    /// The connector, such as card0-HDMI-A-1.
    std::string connector;
    /// Whether a picture is sent there.
    Fact<bool> isEnabled;
    Fact<Edid> edid;
};

/// The connectors that have a monitor, card by card; missing when the directory cannot be read.
Fact<std::vector<Monitor>> readMonitors(const std::filesystem::path& directory);

/// A graphics unit that the device tree describes, as boards without PCI have.
struct BuiltInGraphics {
    /// Such as card0.
    std::string card;
    Fact<std::string> driver;
    /// The first entry of the device tree's "compatible": maker, comma, model.
    std::string compatible;
};

/// In the order of their numbers; missing when the directory cannot be read.
Fact<std::vector<BuiltInGraphics>> readBuiltInGraphics(const std::filesystem::path& directory);

}  // namespace cimomd
