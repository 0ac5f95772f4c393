#pragma once

// The memory modules of this computer. Reads the SMBIOS tables; of a machine whose firmware
// describes no modules one instance stands for what /proc/meminfo has.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/computer/MemoryDevice.h"

namespace cimomd {

class PhysicalMemoryProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_PhysicalMemory";

    explicit PhysicalMemoryProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    /// The instance for one module.
    static ProvidedInstance publish(const MemoryDevice& device);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
