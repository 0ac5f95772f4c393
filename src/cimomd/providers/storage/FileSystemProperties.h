#pragma once

// The properties that all classes of mounted file systems have.

#include <cstdint>
#include <memory>
#include <string>

#include "providers/InstanceBuilder.h"
#include "providers/InstanceStream.h"
#include "system/SystemCalls.h"
#include "system/SystemPaths.h"
#include "system/storage/MountedFileSystem.h"

namespace cimomd {

/// Adds what CIM_FileSystem and the classes above it have, and Device, FileSystemSizeMB and
/// AvailableSpaceMB.
void addFileSystemProperties(InstanceBuilder& builder, const char* className,
                             const std::string& hostName, const Mount& mount,
                             const Fact<FileSystemSize>& size);

/// Makes the instance of one mount.
using PublishFileSystem = ProvidedInstance (*)(const std::string& hostName, const Mount& mount,
                                               const Fact<FileSystemSize>& size);

/// The instances of all file systems of `kind`; each is asked for its size when its turn comes.
/// `calls` must outlive the stream.
std::unique_ptr<InstanceStream> streamFileSystems(const SystemPaths& paths,
                                                  const SystemCalls& calls, FileSystemKind kind,
                                                  PublishFileSystem publish);

}  // namespace cimomd
