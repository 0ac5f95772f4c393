#pragma once

// The processors, one for each socket in use. Reads the processor topology in sysfs, /proc/cpuinfo
// and the firmware's tables.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/processor/InstalledProcessor.h"

namespace cimomd {

class ProcessorProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_Processor";

    explicit ProcessorProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const std::string& hostName,
                                    const InstalledProcessor& processor);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
