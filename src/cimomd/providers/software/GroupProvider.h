#pragma once

// The groups of this machine. Reads /etc/group.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/software/UserGroup.h"

namespace cimomd {

class GroupProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_Group";

    explicit GroupProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const UserGroup& group);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
