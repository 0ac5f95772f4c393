#pragma once

// The firmware of this computer. Reads the SMBIOS tables, without them what the kernel hands on of
// them.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/computer/Firmware.h"

namespace cimomd {

class BiosElementProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_BIOSElement";

    explicit BiosElementProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    /// The instance for one firmware; `uefi`: whether the machine was started that way.
    static ProvidedInstance publish(const Firmware& firmware, bool uefi);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
