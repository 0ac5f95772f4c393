#pragma once

// The disks of this machine as software sees them.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/storage/Disk.h"

namespace cimomd {

class DiskDriveProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_DiskDrive";

    explicit DiskDriveProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const std::string& hostName, const Disk& disk);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
