#include "providers/storage/FileSystemProperties.h"

#include <limits>

#include "files/TextFile.h"
#include "providers/EnumeratedValues.h"
#include "providers/RecordStream.h"
#include "providers/storage/StorageSizes.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint32;
using Pegasus::Uint64;

constexpr std::size_t kMaxMountTableBytes = std::size_t{16} << 20;

// CIM_FileSystem.PersistenceType
constexpr Uint16 kPersistent = 2;
constexpr Uint16 kTemporary = 3;
constexpr Uint16 kExternal = 4;

Uint16 persistenceOf(const std::string& type) {
    if (isTemporary(type))
        return kTemporary;
    return type == "iso9660" || type == "udf" ? kExternal : kPersistent;
}

Fact<Uint64> bytesOf(const Fact<FileSystemSize>& size, std::uint64_t FileSystemSize::*blocks) {
    return size.then([blocks](const FileSystemSize& found) {
        const std::uint64_t count = found.*blocks;
        const std::uint64_t unit = found.fragmentBytes;
        const bool fits = unit == 0 || count <= std::numeric_limits<Uint64>::max() / unit;
        return fits ? std::optional(count * unit) : std::nullopt;
    });
}

Uint16 statusOf(const Fact<FileSystemSize>& size) {
    if (size)
        return kOperationalOk;
    switch (size.reason()) {
        case Absence::TimedOut:
            return kOperationalNoContact;
        case Absence::Unreadable:
            return kOperationalError;
        default:
            return kOperationalUnknown;
    }
}

}  // namespace

void addFileSystemProperties(InstanceBuilder& builder, const char* className,
                             const std::string& hostName, const Mount& mount,
                             const Fact<FileSystemSize>& size) {
    const Fact<Uint64> totalBytes = bytesOf(size, &FileSystemSize::blocks);
    const Fact<Uint64> availableBytes = bytesOf(size, &FileSystemSize::availableBlocks);
    builder.label(mount.mountPoint)
        .key("Name", mount.mountPoint, kSystemNameLength)
        .values<Uint16>("OperationalStatus", {statusOf(size)})
        .value<Uint16>("EnabledState", kEnabled)
        .text("CSCreationClassName", kComputerSystemClass)
        .text("CSName", hostName, kSystemNameLength)
        .text("CreationClassName", className)
        .text("Root", mount.mountPoint)
        .value<Uint64>("BlockSize", size.then([](const FileSystemSize& found) {
            return std::optional(found.fragmentBytes);
        }))
        .value<Uint64>("FileSystemSize", totalBytes)
        .value<Uint64>("AvailableSpace", availableBytes)
        .value<Pegasus::Boolean>("ReadOnly", mount.readOnly)
        .text("FileSystemType", mount.type)
        .value<Uint16>("PersistenceType", persistenceOf(mount.type))
        .text("Device", mount.source.empty() ? Fact<std::string>() : mount.source)
        .value<Uint32>("FileSystemSizeMB", mebibytesOf(totalBytes))
        .value<Uint32>("AvailableSpaceMB", mebibytesOf(availableBytes));
}

std::unique_ptr<InstanceStream> streamFileSystems(const SystemPaths& paths,
                                                  const SystemCalls& calls, FileSystemKind kind,
                                                  PublishFileSystem publish) {
    const auto table = readText(paths.mounts(), kMaxMountTableBytes);
    if (!table)
        return std::make_unique<EmptyStream>(table.reason());
    return std::make_unique<RecordStream<MountedFileSystem>>(
        mountedFileSystems(parseMountInfo(*table), kind),
        [hostName = readHostName(paths), &calls, publish](const MountedFileSystem& fileSystem) {
            return publish(hostName, fileSystem.mount, sizeOf(fileSystem, calls));
        });
}

}  // namespace cimomd
