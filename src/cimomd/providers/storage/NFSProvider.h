#pragma once

// The mounted file systems of NFS servers, each once.

#include "providers/Provider.h"
#include "system/SystemCalls.h"
#include "system/SystemPaths.h"
#include "system/storage/MountInfo.h"

namespace cimomd {

class NFSProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_NFS";

    /// `systemCalls` must outlive the provider.
    NFSProvider(SystemPaths systemPaths, const SystemCalls& systemCalls)
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
