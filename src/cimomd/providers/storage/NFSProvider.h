#pragma once

// The mounted file systems of NFS servers, each once.

#include "providers/storage/FileSystemProvider.h"

namespace cimomd {

class NFSProvider : public FileSystemProvider {
  public:
    static constexpr const char* kClassName = "Velmira_NFS";

    /// `systemCalls` must outlive the provider.
    NFSProvider(SystemPaths systemPaths, const SystemCalls& systemCalls)
        : FileSystemProvider(std::move(systemPaths), systemCalls, FileSystemKind::Nfs, publish) {}

    const char* className() const override { return kClassName; }

    static ProvidedInstance publish(const std::string& hostName, const Mount& mount,
                                    const Fact<FileSystemSize>& size);
};

}  // namespace cimomd
