#pragma once

// Volumes of the device mapper and arrays of software RAID.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/storage/Volume.h"

namespace cimomd {

class StorageVolumeProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_StorageVolume";

    explicit StorageVolumeProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const std::string& hostName, const Volume& volume);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
