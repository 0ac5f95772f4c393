#pragma once

// The time zone of this machine. Reads /etc/localtime and /etc/timezone.

#include "providers/Provider.h"
#include "system/SystemCalls.h"
#include "system/SystemPaths.h"
#include "system/software/LocalTimeZone.h"

namespace cimomd {

class TimeZoneProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_TimeZone";

    /// `systemCalls` must outlive the provider.
    TimeZoneProvider(SystemPaths systemPaths, const SystemCalls& systemCalls)
        : paths(std::move(systemPaths)), calls(systemCalls) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const LocalTimeZone& zone);

  private:
    SystemPaths paths;
    const SystemCalls& calls;
};

}  // namespace cimomd
