#include "providers/storage/CDROMDriveProvider.h"

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "providers/storage/DriveStatus.h"
#include "providers/storage/StorageSizes.h"
#include "providers/storage/StorageValues.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {
namespace {

using Pegasus::Boolean;
using Pegasus::Uint16;
using Pegasus::Uint32;
using Pegasus::Uint64;

bool writesDiscs(const CdromAbilities& can) {
    return can.writesCdR == true || can.writesCdRw == true || can.writesDvdR == true ||
           can.writesDvdRam == true;
}

std::vector<Uint16> capabilitiesOf(const OpticalDrive& drive) {
    std::vector<Uint16> capabilities{kRandomAccess};
    if (writesDiscs(drive.abilities))
        capabilities.push_back(kSupportsWriting);
    if (drive.device.isRemovable == true)
        capabilities.push_back(kRemovableMedia);
    return capabilities;
}

/// A drive that does not tell its speed has the speed 0.
Fact<Uint32> speedOf(const CdromAbilities& can) {
    return narrowed(can.speed).then(
        [](Uint32 speed) { return speed == 0 ? std::nullopt : std::optional(speed); });
}

}  // namespace

std::unique_ptr<InstanceStream> CDROMDriveProvider::enumerate() const {
    const auto records = readOpticalDrives(paths);
    if (!records)
        return std::make_unique<EmptyStream>(records.reason());
    return std::make_unique<RecordStream<OpticalDrive>>(
        *records, [hostName = readHostName(paths)](const OpticalDrive& opticalDrive) {
            return publish(hostName, opticalDrive);
        });
}

ProvidedInstance CDROMDriveProvider::publish(const std::string& hostName,
                                             const OpticalDrive& drive) {
    const BlockDevice& device = drive.device;
    const CdromAbilities& can = drive.abilities;
    InstanceBuilder builder(kClassName);
    builder.label(device.name)
        .text("Name", "/dev/" + device.name)
        .values<Uint16>("OperationalStatus", {driveStatusOf(drive.state)})
        .value<Uint16>("EnabledState", driveEnabledStateOf(drive.state))
        .deviceKeys(hostName, device.name)
        .values<Uint16>("Capabilities", capabilitiesOf(drive))
        // The size of the disc in the drive says nothing about the largest one.
        .value<Uint64>("MaxMediaSize", std::nullopt)
        .value<Uint64>("DefaultBlockSize", device.logicalBlockBytes)
        .text("Manufacturer", drive.identity.vendor)
        .text("Model", drive.identity.model)
        .text("SerialNumber", drive.identity.serial)
        .text("FirmwareVersion", drive.identity.firmware)
        .value<Uint32>("DriveSpeed", speedOf(can))
        .value<Boolean>("WritesCDR", can.writesCdR)
        .value<Boolean>("WritesCDRW", can.writesCdRw)
        .value<Boolean>("ReadsDVD", can.readsDvd)
        .value<Boolean>("WritesDVDR", can.writesDvdR)
        .value<Boolean>("WritesDVDRAM", can.writesDvdRam);
    return builder.take();
}

}  // namespace cimomd
