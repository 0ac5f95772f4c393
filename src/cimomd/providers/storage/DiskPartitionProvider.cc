#include "providers/storage/DiskPartitionProvider.h"

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "providers/storage/StorageSizes.h"
#include "providers/storage/StorageValues.h"
#include "system/computer/SystemIdentity.h"
#include "system/storage/BlockDevice.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint32;
using Pegasus::Uint64;

// CIM_DiskPartition.PartitionType
constexpr Uint16 kPrimary = 1;
constexpr Uint16 kExtended = 2;
constexpr Uint16 kLogical = 3;

Uint16 partitionTypeOf(PartitionKind kind) {
    switch (kind) {
        case PartitionKind::Extended:
            return kExtended;
        case PartitionKind::Logical:
            return kLogical;
        default:
            return kPrimary;
    }
}

}  // namespace

std::unique_ptr<InstanceStream> DiskPartitionProvider::enumerate() const {
    const auto records = readPartitions(paths);
    if (!records)
        return std::make_unique<EmptyStream>(records.reason());
    return std::make_unique<RecordStream<Partition>>(
        *records, [hostName = readHostName(paths)](const Partition& partition) {
            return publish(hostName, partition);
        });
}

ProvidedInstance DiskPartitionProvider::publish(const std::string& hostName,
                                                const Partition& partition) {
    InstanceBuilder builder(kClassName);
    builder.label(partition.name)
        .text("Name", "/dev/" + partition.name)
        .values<Uint16>("OperationalStatus", {kOperationalUnknown})
        .value<Uint16>("EnabledState", std::nullopt)
        .deviceKeys(hostName, partition.name)
        .value<Uint64>("BlockSize", kSectorBytes)
        .value<Uint64>("NumberOfBlocks", partition.sizeSectors)
        .values<Uint16>("ExtentStatus", {kExtentStatusNone})
        .value<Uint16>("NameFormat", kNameFormatOsDevice)
        .value<Pegasus::Boolean>("PrimaryPartition", partition.kind == PartitionKind::Primary)
        .value<Uint16>("PartitionType", partitionTypeOf(partition.kind))
        .text("Disk", partition.disk)
        .value<Uint32>("PartitionNumber", narrowed(partition.number))
        .value<Uint64>("StartingBlock", partition.startSectors)
        .value<Uint32>("StartMB", mebibytesOf(bytesOfSectors(partition.startSectors)))
        .value<Uint32>("SizeMB", mebibytesOf(bytesOfSectors(partition.sizeSectors)))
        .value<Pegasus::Boolean>("ReadOnly", partition.isReadOnly);
    return builder.take();
}

}  // namespace cimomd
