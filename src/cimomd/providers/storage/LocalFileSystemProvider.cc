#include "providers/storage/LocalFileSystemProvider.h"

#include <limits>

#include "files/TextFile.h"
#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint32;
using Pegasus::Uint64;

constexpr std::size_t kMaxMountTableBytes = std::size_t{16} << 20;
constexpr Uint64 kBytesPerMB = Uint64{1} << 20;

// CIM_FileSystem.PersistenceType
constexpr Uint16 kPersistent = 2;
constexpr Uint16 kTemporary = 3;
constexpr Uint16 kExternal = 4;

Uint16 persistenceOf(const std::string& type) {
    if (type == "tmpfs" || type == "ramfs")
        return kTemporary;
    if (type == "iso9660" || type == "udf")
        return kExternal;
    return kPersistent;
}

/// The numbers of an instance; nothing where they are unknown or beyond 64 bits.
struct Sizes {
    std::optional<Uint64> blockBytes;
    std::optional<Uint64> totalBytes;
    std::optional<Uint64> availableBytes;
    std::optional<Uint64> totalInodes;
    std::optional<Uint64> freeInodes;
};

std::optional<Uint64> product(std::uint64_t a, std::uint64_t b) {
    if (a != 0 && b > std::numeric_limits<Uint64>::max() / a)
        return std::nullopt;
    return a * b;
}

Sizes sizesOf(const std::optional<FileSystemSize>& size) {
    Sizes out;
    if (!size)
        return out;
    out.blockBytes = size->fragmentBytes;
    out.totalBytes = product(size->blocks, size->fragmentBytes);
    out.availableBytes = product(size->availableBlocks, size->fragmentBytes);
    // File systems that make inodes as they need them report none.
    if (size->inodes != 0) {
        out.totalInodes = size->inodes;
        out.freeInodes = size->freeInodes;
    }
    return out;
}

std::optional<Uint32> megabytes(const std::optional<Uint64>& bytes) {
    if (!bytes || *bytes / kBytesPerMB > std::numeric_limits<Uint32>::max())
        return std::nullopt;
    return static_cast<Uint32>(*bytes / kBytesPerMB);
}

}  // namespace

std::unique_ptr<InstanceStream> LocalFileSystemProvider::enumerate() const {
    const auto table = readText(paths.mounts(), kMaxMountTableBytes);
    if (!table)
        throw ProviderError("the mount table /proc/self/mountinfo cannot be read");
    const std::string hostName = readHostName(paths);
    const SystemCalls& systemCalls = calls;
    return std::make_unique<RecordStream<Mount>>(
        localFileSystems(parseMountInfo(*table)), [hostName, &systemCalls](const Mount& mount) {
            return publish(hostName, mount, systemCalls.fileSystemSize(mount.mountPoint));
        });
}

ProvidedInstance LocalFileSystemProvider::publish(const std::string& hostName, const Mount& mount,
                                                  const std::optional<FileSystemSize>& size) {
    const Sizes sizes = sizesOf(size);
    InstanceBuilder builder(kClassName);
    builder.label(mount.mountPoint)
        .key("Name", mount.mountPoint, kSystemNameLength)
        .values<Uint16>("OperationalStatus", {kOperationalOk})
        .value<Uint16>("EnabledState", kEnabled)
        .text("CSCreationClassName", kComputerSystemClass)
        .text("CSName", hostName, kSystemNameLength)
        .text("CreationClassName", kClassName)
        .text("Root", mount.mountPoint)
        .value<Uint64>("BlockSize", sizes.blockBytes)
        .value<Uint64>("FileSystemSize", sizes.totalBytes)
        .value<Uint64>("AvailableSpace", sizes.availableBytes)
        .value<Pegasus::Boolean>("ReadOnly", mount.readOnly)
        .text("FileSystemType", mount.type)
        .value<Uint16>("PersistenceType", persistenceOf(mount.type))
        .value<Uint64>("TotalInodes", sizes.totalInodes)
        .value<Uint64>("FreeInodes", sizes.freeInodes)
        .text("Device", mount.source)
        .value<Uint32>("FileSystemSizeMB", megabytes(sizes.totalBytes))
        .value<Uint32>("AvailableSpaceMB", megabytes(sizes.availableBytes));
    return builder.take();
}

}  // namespace cimomd
