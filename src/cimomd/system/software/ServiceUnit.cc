#include "system/software/ServiceUnit.h"

#include <map>
#include <string_view>

namespace cimomd {
namespace {

constexpr std::chrono::seconds kDeadline(2);

// name, description, load state, active state, sub state, followed unit, path, job
constexpr const char* kUnitTypes = "ssssssouso";
enum UnitColumn : std::size_t { kName, kDescription, kLoadState, kActiveState, kSubState };

// path, state
constexpr const char* kFileTypes = "ss";
enum FileColumn : std::size_t { kPath, kFileState };

bool isService(std::string_view name) {
    constexpr std::string_view kEnding = ".service";
    constexpr std::string_view kTemplate = "@.service";
    return name.ends_with(kEnding) && name != kEnding && !name.ends_with(kTemplate);
}

std::string_view fileNameOf(std::string_view path) {
    return path.substr(path.rfind('/') + 1);
}

using Units = std::map<std::string, ServiceUnit, std::less<>>;

void addFile(Units& units, const SystemBus::Row& row) {
    const std::string name(fileNameOf(row.at(kPath)));
    const std::string& state = row.at(kFileState);
    if (!isService(name) || state == "alias")
        return;
    ServiceUnit& unit = units[name];
    unit.name = name;
    unit.fileState = state.empty() ? Fact<std::string>() : Fact<std::string>(state);
}

}  // namespace

std::vector<ServiceUnit> serviceUnitsOf(const std::vector<SystemBus::Row>& units,
                                        const Fact<std::vector<SystemBus::Row>>& files) {
    Units found;
    for (const SystemBus::Row& row : units) {
        const std::string& name = row.at(kName);
        if (!isService(name) || row.at(kLoadState) == "not-found")
            continue;
        ServiceUnit& unit = found[name];
        unit = {name, row.at(kDescription), row.at(kActiveState), row.at(kSubState), {}};
        if (!files)
            unit.fileState = files.reason();
    }
    if (files) {
        for (const SystemBus::Row& row : *files)
            addFile(found, row);
    }
    std::vector<ServiceUnit> sorted;
    for (auto& [name, unit] : found)
        sorted.push_back(std::move(unit));
    return sorted;
}

Fact<std::vector<ServiceUnit>> readServiceUnits(const std::filesystem::path& socketPath) {
    SystemBus bus(socketPath, kDeadline);
    const Fact<std::vector<SystemBus::Row>> units = bus.list("ListUnits", kUnitTypes);
    if (!units)
        return units.reason();
    return serviceUnitsOf(*units, bus.list("ListUnitFiles", kFileTypes));
}

}  // namespace cimomd
