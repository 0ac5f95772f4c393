#pragma once

// The main memory as a whole. Reads /proc/meminfo, and the SMBIOS tables to hold against it.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/computer/MemoryDevice.h"

namespace cimomd {

class MemoryProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_Memory";

    explicit MemoryProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    /// The instance for a machine of that name whose kernel uses `totalKB`, in units of 1024
    /// bytes; `devices` are the modules, or why they are not known.
    static ProvidedInstance publish(const std::string& hostName, std::uint64_t totalKB,
                                    const Fact<std::vector<MemoryDevice>>& devices);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
