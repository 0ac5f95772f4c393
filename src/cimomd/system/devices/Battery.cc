#include "system/devices/Battery.h"

#include <algorithm>

#include "files/TextFile.h"
#include "system/Narrowing.h"
#include "system/computer/FirmwareText.h"
#include "text/NaturalOrder.h"

namespace cimomd {
namespace {

constexpr std::uint64_t kMicroPerMilli = 1000;
// Microampere-hours times microvolts in a milliwatt-hour.
constexpr std::uint64_t kPicoPerMilli = 1000000000;

/// Energy, charge and voltage of a battery that is there are never 0; some firmware says so.
Fact<std::uint64_t> readAmount(const std::filesystem::path& path) {
    return readNumber(path).then(
        [](std::uint64_t amount) { return amount == 0 ? std::nullopt : std::optional(amount); });
}

/// The voltage that turns a charge into energy: the designed one, else the present one.
Fact<std::uint64_t> readMicrovolts(const std::filesystem::path& directory) {
    const auto designed = readAmount(directory / "voltage_min_design");
    return designed ? designed : readAmount(directory / "voltage_now");
}

std::optional<std::uint64_t> milliwattHours(std::uint64_t microampereHours,
                                            std::uint64_t microvolts) {
    if (microampereHours > UINT32_MAX || microvolts > UINT32_MAX)
        return std::nullopt;
    return microampereHours * microvolts / kPicoPerMilli;
}

/// Firmware counts energy or charge; `which` is full or full_design.
Fact<std::uint32_t> readCapacity(const std::filesystem::path& directory, const std::string& which) {
    const auto energy = readAmount(directory / ("energy_" + which));
    if (energy)
        return energy.then([](std::uint64_t microwattHours) {
            return narrowedToCount(microwattHours / kMicroPerMilli);
        });
    const auto charge = readAmount(directory / ("charge_" + which));
    if (!charge)
        return charge.reason() == Absence::Absent ? energy.reason() : charge.reason();
    const auto microvolts = readMicrovolts(directory);
    if (!microvolts)
        return microvolts.reason();
    return charge
        .then([&](std::uint64_t microampereHours) {
            return milliwattHours(microampereHours, *microvolts);
        })
        .then(narrowedToCount<std::uint64_t>);
}

Fact<std::uint16_t> readPercent(const std::filesystem::path& path) {
    return readNumber(path).then([](std::uint64_t percent) {
        return percent <= 100 ? narrowedTo<std::uint16_t>(percent) : std::nullopt;
    });
}

Battery readBattery(const std::filesystem::path& directory, const std::string& name) {
    Battery out;
    out.name = name;
    out.manufacturer = withoutPlaceholder(readFact(directory / "manufacturer"));
    out.model = withoutPlaceholder(readFact(directory / "model_name"));
    out.serialNumber = withoutPlaceholder(readFact(directory / "serial_number"));
    out.technology = readFact(directory / "technology");
    out.status = readFact(directory / "status");
    out.level = readFact(directory / "capacity_level");
    out.designMilliwattHours = readCapacity(directory, "full_design");
    out.fullMilliwattHours = readCapacity(directory, "full");
    out.designMillivolts =
        readAmount(directory / "voltage_min_design").then([](std::uint64_t microvolts) {
            return microvolts / kMicroPerMilli;
        });
    out.remainingPercent = readPercent(directory / "capacity");
    // Drivers write 0 when the firmware does not count.
    out.chargeCycles = readAmount(directory / "cycle_count").then(narrowedToCount<std::uint64_t>);
    return out;
}

bool feedsThisComputer(const std::filesystem::path& directory) {
    return readFact(directory / "type") == "Battery" && readFact(directory / "scope") != "Device" &&
           readNumber(directory / "present") != 0U;
}

}  // namespace

Fact<std::vector<Battery>> readBatteries(const std::filesystem::path& directory) {
    const auto names = listDirectory(directory);
    if (!names)
        return names.reason();
    std::vector<Battery> batteries;
    for (const std::string& name : *names) {
        if (feedsThisComputer(directory / name))
            batteries.push_back(readBattery(directory / name, name));
    }
    std::sort(batteries.begin(), batteries.end(),
              [](const Battery& a, const Battery& b) { return naturallyBefore(a.name, b.name); });
    return batteries;
}

}  // namespace cimomd
