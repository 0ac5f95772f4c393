#include "providers/storage/StorageVolumeProvider.h"

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "providers/storage/StorageSizes.h"
#include "providers/storage/StorageValues.h"
#include "providers/storage/VolumeStatus.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint32;
using Pegasus::Uint64;

constexpr const char* kSoftwareRaid = "MD";

std::string pathOf(const Volume& volume) {
    if (volume.mapperName)
        return "/dev/mapper/" + *volume.mapperName;
    return "/dev/" + volume.device.name;
}

/// Who uses the device mapper writes its own name at the front of the identity: "LVM-0FQJ...".
Fact<std::string> volumeTypeOf(const Volume& volume) {
    if (volume.isRaid)
        return std::string(kSoftwareRaid);
    return volume.uuid.then([](const std::string& uuid) {
        const std::size_t dash = uuid.find('-');
        return dash == 0 || dash == std::string::npos ? std::nullopt
                                                      : std::optional(uuid.substr(0, dash));
    });
}

}  // namespace

std::unique_ptr<InstanceStream> StorageVolumeProvider::enumerate() const {
    const auto records = readVolumes(paths);
    if (!records)
        return std::make_unique<EmptyStream>(records.reason());
    return std::make_unique<RecordStream<Volume>>(
        *records, [hostName = readHostName(paths)](const Volume& volume) {
            return publish(hostName, volume);
        });
}

ProvidedInstance StorageVolumeProvider::publish(const std::string& hostName, const Volume& volume) {
    const BlockDevice& device = volume.device;
    InstanceBuilder builder(kClassName);
    builder.label(volume.mapperName.value_or(device.name))
        .text("Name", pathOf(volume))
        .values<Uint16>("OperationalStatus", {volumeStatusOf(volume)})
        .value<Uint16>("EnabledState", volumeEnabledStateOf(volume))
        .deviceKeys(hostName, device.name)
        .value<Uint64>("BlockSize", kSectorBytes)
        .value<Uint64>("NumberOfBlocks", device.sizeSectors)
        .values<Uint16>("ExtentStatus", extentStatusOf(volume))
        .value<Uint16>("NameFormat", kNameFormatOsDevice)
        .value<Uint32>("SizeMB", mebibytesOf(bytesOfSectors(device.sizeSectors)))
        .value<Pegasus::Boolean>("ReadOnly", device.isReadOnly)
        .text("VolumeType", volumeTypeOf(volume))
        .text("VolumeUUID", volume.uuid)
        .texts("Members", volume.members)
        .text("RAIDLevel", volume.raid.level)
        .text("ArrayState", volume.raid.arrayState)
        .value<Uint32>("RAIDDisks", narrowed(volume.raid.disks))
        .value<Uint32>("MissingDisks", narrowed(volume.raid.missingDisks));
    return builder.take();
}

}  // namespace cimomd
