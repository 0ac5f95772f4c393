#pragma once

// The cases of this computer. Reads the SMBIOS tables, without them what the kernel hands on of
// them.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/computer/Chassis.h"

namespace cimomd {

class ChassisProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_Chassis";

    explicit ChassisProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    /// The instance for one case.
    static ProvidedInstance publish(const Chassis& chassis);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
