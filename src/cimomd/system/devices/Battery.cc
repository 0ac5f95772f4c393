#include "system/devices/Battery.h"

#include <algorithm>
#include <array>

#include "files/TextFile.h"
#include "system/FileTexts.h"
#include "system/Narrowing.h"
#include "system/computer/FirmwareText.h"
#include "text/NaturalOrder.h"

namespace cimomd {
namespace {

constexpr std::uint64_t kMicroPerMilli = 1000;
// Microampere-hours times microvolts in a milliwatt-hour.
constexpr std::uint64_t kPicoPerMilli = 1000000000;

constexpr std::array kFileNames{"scope",
                                "present",
                                "manufacturer",
                                "model_name",
                                "serial_number",
                                "technology",
                                "status",
                                "capacity_level",
                                "capacity",
                                "cycle_count",
                                "energy_full",
                                "energy_full_design",
                                "charge_full",
                                "charge_full_design",
                                "voltage_min_design",
                                "voltage_now"};

/// What the files of one directory say.
struct Supply {
    const FileTexts& texts;
    std::filesystem::path directory;

    Fact<std::string> fact(const char* name) const { return texts.fact(directory / name); }
    Fact<std::uint64_t> number(const char* name) const { return texts.number(directory / name); }

    /// Energy, charge and voltage of a battery that is there are never 0; some firmware says so.
    Fact<std::uint64_t> amount(const std::string& name) const {
        return texts.number(directory / name).then([](std::uint64_t amount) {
            return amount == 0 ? std::nullopt : std::optional(amount);
        });
    }
};

/// The voltage that turns a charge into energy: the designed one, else the present one.
Fact<std::uint64_t> microvoltsOf(const Supply& supply) {
    const auto designed = supply.amount("voltage_min_design");
    return designed ? designed : supply.amount("voltage_now");
}

std::optional<std::uint64_t> milliwattHours(std::uint64_t microampereHours,
                                            std::uint64_t microvolts) {
    if (microampereHours > UINT32_MAX || microvolts > UINT32_MAX)
        return std::nullopt;
    return microampereHours * microvolts / kPicoPerMilli;
}

/// Firmware counts energy or charge; `which` is full or full_design.
Fact<std::uint32_t> capacityOf(const Supply& supply, const std::string& which) {
    const auto energy = supply.amount("energy_" + which);
    if (energy)
        return energy.then([](std::uint64_t microwattHours) {
            return narrowedToCount(microwattHours / kMicroPerMilli);
        });
    const auto charge = supply.amount("charge_" + which);
    if (!charge)
        return charge.reason() == Absence::Absent ? energy.reason() : charge.reason();
    const auto microvolts = microvoltsOf(supply);
    if (!microvolts)
        return microvolts.reason();
    return charge
        .then([&](std::uint64_t microampereHours) {
            return milliwattHours(microampereHours, *microvolts);
        })
        .then(narrowedToCount<std::uint64_t>);
}

std::optional<std::uint16_t> percentOf(std::uint64_t percent) {
    return percent <= 100 ? narrowedTo<std::uint16_t>(percent) : std::nullopt;
}

Battery batteryOf(const Supply& supply) {
    Battery out;
    out.name = supply.directory.filename().string();
    out.manufacturer = withoutPlaceholder(supply.fact("manufacturer"));
    out.model = withoutPlaceholder(supply.fact("model_name"));
    out.serialNumber = withoutPlaceholder(supply.fact("serial_number"));
    out.technology = supply.fact("technology");
    out.status = supply.fact("status");
    out.level = supply.fact("capacity_level");
    out.designMilliwattHours = capacityOf(supply, "full_design");
    out.fullMilliwattHours = capacityOf(supply, "full");
    out.designMillivolts = supply.amount("voltage_min_design").then([](std::uint64_t microvolts) {
        return microvolts / kMicroPerMilli;
    });
    out.remainingPercent = supply.number("capacity").then(percentOf);
    // Drivers write 0 when the firmware does not count.
    out.chargeCycles = supply.amount("cycle_count").then(narrowedToCount<std::uint64_t>);
    return out;
}

/// The kernel knows the type without asking the driver: a battery that hangs is still listed.
bool isBattery(const std::filesystem::path& directory) {
    return readFact(directory / "type") == "Battery";
}

bool feedsThisComputer(const Supply& supply) {
    return supply.fact("scope") != "Device" && supply.number("present") != 0U;
}

std::vector<std::filesystem::path> filesOf(const std::vector<std::filesystem::path>& batteries) {
    std::vector<std::filesystem::path> files;
    for (const std::filesystem::path& directory : batteries) {
        for (const char* name : kFileNames)
            files.push_back(directory / name);
    }
    return files;
}

}  // namespace

Fact<std::vector<Battery>> readBatteries(const std::filesystem::path& directory,
                                         const SystemCalls& calls) {
    const auto names = listDirectory(directory);
    if (!names)
        return names.reason();
    std::vector<std::filesystem::path> directories;
    for (const std::string& name : *names) {
        if (isBattery(directory / name))
            directories.push_back(directory / name);
    }
    const FileTexts texts(TextSource::Batteries, filesOf(directories), calls);
    std::vector<Battery> batteries;
    for (const std::filesystem::path& place : directories) {
        const Supply supply{texts, place};
        if (feedsThisComputer(supply))
            batteries.push_back(batteryOf(supply));
    }
    std::sort(batteries.begin(), batteries.end(),
              [](const Battery& a, const Battery& b) { return naturallyBefore(a.name, b.name); });
    return batteries;
}

}  // namespace cimomd
