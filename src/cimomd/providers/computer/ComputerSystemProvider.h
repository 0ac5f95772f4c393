#pragma once

// This computer. Reads the host name, the firmware's identity texts or the device tree, and the
// machine id; serial number and UUID are readable for root only.

#include "providers/EnumeratedValues.h"
#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {

class ComputerSystemProvider : public Provider {
  public:
    static constexpr const char* kClassName = kComputerSystemClass;

    explicit ComputerSystemProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    /// The instance for a machine of that name and identity.
    static ProvidedInstance publish(const std::string& hostName, const SystemIdentity& identity);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
