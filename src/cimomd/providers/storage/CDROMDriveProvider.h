#pragma once

// The drives for optical discs.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/storage/OpticalDrive.h"

namespace cimomd {

class CDROMDriveProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_CDROMDrive";

    explicit CDROMDriveProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const std::string& hostName, const OpticalDrive& opticalDrive);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
