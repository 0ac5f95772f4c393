#pragma once

// The mounted file systems of servers other than those of NFS, each once.

#include "providers/storage/FileSystemProvider.h"

namespace cimomd {

class RemoteFileSystemProvider : public FileSystemProvider {
  public:
    static constexpr const char* kClassName = "Velmira_RemoteFileSystem";

    /// `systemCalls` must outlive the provider.
    RemoteFileSystemProvider(SystemPaths systemPaths, const SystemCalls& systemCalls)
        : FileSystemProvider(std::move(systemPaths), systemCalls, FileSystemKind::Remote, publish) {
    }

    const char* className() const override { return kClassName; }

    static ProvidedInstance publish(const std::string& hostName, const Mount& mount,
                                    const Fact<FileSystemSize>& size);
};

}  // namespace cimomd
