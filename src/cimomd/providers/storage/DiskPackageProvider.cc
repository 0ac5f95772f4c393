#include "providers/storage/DiskPackageProvider.h"

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "providers/storage/DriveStatus.h"

namespace cimomd {
namespace {

// MaxLen of CIM_PhysicalElement.Version.
constexpr std::size_t kVersionLength = 64;

}  // namespace

std::unique_ptr<InstanceStream> DiskPackageProvider::enumerate() const {
    const auto disks = readDisks(paths);
    if (!disks)
        return std::make_unique<EmptyStream>(disks.reason());
    return std::make_unique<RecordStream<Disk>>(*disks, publish);
}

ProvidedInstance DiskPackageProvider::publish(const Disk& disk) {
    const DriveIdentity& identity = disk.identity;
    const std::string path = "/dev/" + disk.device.name;
    InstanceBuilder builder(kClassName);
    builder.label(identity.model.value_or(disk.device.name))
        .text("Name", path)
        .values<Pegasus::Uint16>("OperationalStatus", {driveStatusOf(disk.state)})
        .physicalKeys(path)
        .text("Manufacturer", identity.vendor, kSystemNameLength)
        .text("Model", identity.model, kSystemNameLength)
        .text("SKU", std::nullopt)
        .text("SerialNumber", identity.serial, kSystemNameLength)
        .text("Version", identity.firmware, kVersionLength)
        .text("PartNumber", std::nullopt)
        .text("OtherIdentifyingInfo", identity.worldWideId, kSystemNameLength)
        .value<Pegasus::Boolean>("Removable", std::nullopt)
        .value<Pegasus::Boolean>("Replaceable", std::nullopt)
        .value<Pegasus::Boolean>("HotSwappable", std::nullopt);
    return builder.take();
}

}  // namespace cimomd
