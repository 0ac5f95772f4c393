#include "providers/storage/LocalFileSystemProvider.h"

#include "providers/storage/FileSystemProperties.h"

namespace cimomd {
namespace {

using Pegasus::Uint64;

/// File systems that make inodes as they need them report none.
Fact<Uint64> inodesOf(const Fact<FileSystemSize>& size, std::uint64_t FileSystemSize::*number) {
    return size.then(
        [number](const FileSystemSize& found) {
            return found.inodes == 0 ? std::nullopt : std::optional(found.*number);
        },
        Absence::Absent);
}

}  // namespace

ProvidedInstance LocalFileSystemProvider::publish(const std::string& hostName, const Mount& mount,
                                                  const Fact<FileSystemSize>& size) {
    InstanceBuilder builder(kClassName);
    addFileSystemProperties(builder, kClassName, hostName, mount, size);
    builder.value<Uint64>("TotalInodes", inodesOf(size, &FileSystemSize::inodes))
        .value<Uint64>("FreeInodes", inodesOf(size, &FileSystemSize::freeInodes));
    return builder.take();
}

}  // namespace cimomd
