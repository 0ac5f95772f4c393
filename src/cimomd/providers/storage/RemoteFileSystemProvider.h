#pragma once

// The mounted file systems of servers other than those of NFS, each once.

#include "providers/Provider.h"
#include "system/SystemCalls.h"
#include "system/SystemPaths.h"
#include "system/storage/MountInfo.h"

namespace cimomd {

class RemoteFileSystemProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_RemoteFileSystem";

    /// `systemCalls` must outlive the provider.
    RemoteFileSystemProvider(SystemPaths systemPaths, const SystemCalls& systemCalls)
        : paths(std::move(systemPaths)), calls(systemCalls) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const std::string& hostName, const Mount& mount,
                                    const Fact<FileSystemSize>& size);

  private:
    SystemPaths paths;
    const SystemCalls& calls;
};

}  // namespace cimomd
