#include "providers/computer/BiosElementProvider.h"

#include <fmt/format.h>

#include <chrono>

#include "providers/CimTime.h"
#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint32;

// CIM_SoftwareElement.SoftwareElementState and .TargetOperatingSystem
constexpr Uint16 kRunning = 3;
constexpr Uint16 kNoOperatingSystem = 66;

constexpr std::size_t kVersionLength = 64;
constexpr std::size_t kManufacturerLength = 256;
constexpr std::size_t kReleaseLength = 16;

/// The start of the day in UTC: of the time of day nothing is known.
std::optional<Pegasus::CIMDateTime> startOf(const CalendarDate& date) {
    const std::chrono::sys_days day{std::chrono::year(date.year) / std::chrono::month(date.month) /
                                    std::chrono::day(date.day)};
    return cimTimeOf(
        std::chrono::duration_cast<std::chrono::seconds>(day.time_since_epoch()).count(), 0);
}

/// A key may not be null, and an empty one does not get through every client.
std::string versionKeyOf(const Firmware& firmware) {
    return firmware.version ? *firmware.version : firmware.release.value_or("Unknown");
}

}  // namespace

std::unique_ptr<InstanceStream> BiosElementProvider::enumerate() const {
    const Fact<std::vector<Firmware>> found = readFirmware(paths);
    if (!found)
        return std::make_unique<EmptyStream>(found.reason());
    const bool uefi = startedByUefi(paths);
    return std::make_unique<RecordStream<Firmware>>(
        *found, [uefi](const Firmware& firmware) { return publish(firmware, uefi); });
}

ProvidedInstance BiosElementProvider::publish(const Firmware& firmware, bool uefi) {
    const char* const type = uefi ? "UEFI" : "BIOS";
    InstanceBuilder builder(kClassName);
    builder.label(firmware.version ? fmt::format("{} {}", type, *firmware.version) : type)
        .text("Name", "System firmware")
        .key("Version", versionKeyOf(firmware), kVersionLength)
        .value<Uint16>("SoftwareElementState", kRunning)
        .key("SoftwareElementID", fmt::format("Firmware {}", firmware.index))
        .value<Uint16>("TargetOperatingSystem", kNoOperatingSystem)
        .values<Uint16>("OperationalStatus", {kOperationalOk})
        .text("Manufacturer", firmware.vendor, kManufacturerLength)
        .value<Pegasus::Boolean>("PrimaryBIOS", firmware.index == 0)
        .value<Pegasus::CIMDateTime>("ReleaseDate", firmware.releaseDate.then(startOf))
        .text("FirmwareType", type)
        .text("Release", firmware.release, kReleaseLength)
        .text("ControllerRelease", firmware.controllerRelease, kReleaseLength)
        .value<Uint32>("RomSizeKB", firmware.romKB);
    return builder.take();
}

}  // namespace cimomd
