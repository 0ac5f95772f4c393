#pragma once

// The mounted file systems on devices of this machine, each once.

#include "providers/storage/FileSystemProvider.h"

namespace cimomd {

class LocalFileSystemProvider : public FileSystemProvider {
  public:
    static constexpr const char* kClassName = "Velmira_LocalFileSystem";

    /// `systemCalls` must outlive the provider.
    LocalFileSystemProvider(SystemPaths systemPaths, const SystemCalls& systemCalls)
        : FileSystemProvider(std::move(systemPaths), systemCalls, FileSystemKind::Local, publish) {}

    const char* className() const override { return kClassName; }

    static ProvidedInstance publish(const std::string& hostName, const Mount& mount,
                                    const Fact<FileSystemSize>& size);
};

}  // namespace cimomd
