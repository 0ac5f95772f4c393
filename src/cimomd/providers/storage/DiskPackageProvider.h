#pragma once

// The disks of this machine as things: who made them, and which ones they are.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/storage/Disk.h"

namespace cimomd {

class DiskPackageProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_DiskPackage";

    explicit DiskPackageProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const Disk& disk);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
