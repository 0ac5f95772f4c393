#pragma once

// The partitions of the disks.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/storage/Partition.h"

namespace cimomd {

class DiskPartitionProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_DiskPartition";

    explicit DiskPartitionProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const std::string& hostName, const Partition& partition);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
