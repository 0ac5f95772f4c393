#include "system/storage/OpticalDrive.h"

#include "files/TextFields.h"
#include "files/TextFile.h"

namespace cimomd {
namespace {

bool isOpticalDrive(std::string_view entry) {
    return entry.substr(0, 2) == "sr" && parseUnsigned(entry.substr(2)).has_value();
}

}  // namespace

Fact<std::vector<OpticalDrive>> readOpticalDrives(const SystemPaths& paths) {
    return listDevices(paths.blockDevices()).then([&paths](const auto& entries) {
        auto abilities = parseCdromInfo(readText(paths.opticalDrives()).value_or(""));
        std::vector<OpticalDrive> drives;
        for (const std::string& entry : entries) {
            if (!isOpticalDrive(entry))
                continue;
            const std::filesystem::path directory = paths.blockDevices() / entry;
            const UdevRecord udev = readUdevRecord(paths.udevRecords(), directory);
            drives.push_back({readBlockDevice(directory), readDriveIdentity(directory, udev),
                              readFact(directory / "device/state"), abilities[entry]});
        }
        return std::optional(std::move(drives));
    });
}

}  // namespace cimomd
