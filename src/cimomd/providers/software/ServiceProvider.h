#pragma once

// The services that systemd manages. Asks it over D-Bus.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/software/ServiceUnit.h"

namespace cimomd {

class ServiceProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_Service";

    explicit ServiceProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    /// Without instances where no systemd answers.
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const std::string& hostName, const ServiceUnit& unit);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
