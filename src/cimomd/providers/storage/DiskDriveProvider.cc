#include "providers/storage/DiskDriveProvider.h"

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "providers/storage/DriveStatus.h"
#include "providers/storage/StorageSizes.h"
#include "providers/storage/StorageValues.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint32;
using Pegasus::Uint64;

// Velmira_DiskDrive.DiskType
constexpr Uint16 kOtherDisk = 1;
constexpr Uint16 kHardDisk = 2;
constexpr Uint16 kSolidState = 3;

// CIM_MediaAccessDevice.MaxMediaSize counts in units of 1000 bytes.
constexpr Uint64 kBytesPerKB = 1000;

std::vector<Uint16> capabilitiesOf(const BlockDevice& device) {
    std::vector<Uint16> capabilities{kRandomAccess};
    if (device.isReadOnly == false)
        capabilities.push_back(kSupportsWriting);
    if (device.isRemovable == true)
        capabilities.push_back(kRemovableMedia);
    return capabilities;
}

/// A drive without a medium has the size 0.
Fact<Uint64> mediaBytesOf(const BlockDevice& device) {
    return bytesOfSectors(device.sizeSectors)
        .then([](Uint64 bytes) { return bytes == 0 ? std::nullopt : std::optional(bytes); },
              Absence::Absent);
}

/// The kernel takes for rotating whatever does not say otherwise: the disks of hypervisors, USB
/// sticks, card readers.
Fact<Uint16> diskTypeOf(const BlockDevice& device) {
    const bool isVirtual = device.name.substr(0, 2) == "vd" || device.name.substr(0, 3) == "xvd";
    const bool isRemovable = device.isRemovable == true;
    return device.isRotational.then([isVirtual, isRemovable](bool rotates) {
        if (isVirtual)
            return std::optional<Uint16>();
        if (!rotates)
            return std::optional(kSolidState);
        return std::optional(isRemovable ? kOtherDisk : kHardDisk);
    });
}

}  // namespace

std::unique_ptr<InstanceStream> DiskDriveProvider::enumerate() const {
    const auto records = readDisks(paths);
    if (!records)
        return std::make_unique<EmptyStream>(records.reason());
    return std::make_unique<RecordStream<Disk>>(
        *records,
        [hostName = readHostName(paths)](const Disk& disk) { return publish(hostName, disk); });
}

ProvidedInstance DiskDriveProvider::publish(const std::string& hostName, const Disk& disk) {
    const BlockDevice& device = disk.device;
    const Fact<Uint64> bytes = mediaBytesOf(device);
    InstanceBuilder builder(kClassName);
    builder.label(device.name)
        .text("Name", "/dev/" + device.name)
        .values<Uint16>("OperationalStatus", {driveStatusOf(disk.state)})
        .value<Uint16>("EnabledState", driveEnabledStateOf(disk.state))
        .deviceKeys(hostName, device.name)
        .values<Uint16>("Capabilities", capabilitiesOf(device))
        .value<Uint64>("MaxMediaSize",
                       bytes.then([](Uint64 size) { return std::optional(size / kBytesPerKB); }))
        .value<Uint64>("DefaultBlockSize", device.logicalBlockBytes)
        .value<Uint32>("MaxMediaSizeMB", decimalMegabytesOf(bytes))
        .enumerated("DiskType", diskTypeOf(device))
        .text("Model", disk.identity.model)
        .text("SerialNumber", disk.identity.serial);
    return builder.take();
}

}  // namespace cimomd
