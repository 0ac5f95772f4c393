#pragma once

// The slots of this computer. Reads the SMBIOS tables.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/computer/Slot.h"

namespace cimomd {

class SlotProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_Slot";

    explicit SlotProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    /// The instance for one slot.
    static ProvidedInstance publish(const Slot& slot);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
