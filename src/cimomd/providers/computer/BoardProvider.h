#pragma once

// The boards of this computer. Reads the SMBIOS tables, without them what the kernel hands on of
// them.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/computer/Board.h"

namespace cimomd {

class BoardProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_Card";

    explicit BoardProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    /// The instance for one board.
    static ProvidedInstance publish(const Board& board);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
