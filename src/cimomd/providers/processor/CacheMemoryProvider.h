#pragma once

// The caches of the processors, each once however many share it. Reads
// /sys/devices/system/cpu/cpu*/cache.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/processor/ProcessorCache.h"

namespace cimomd {

class CacheMemoryProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_CacheMemory";

    explicit CacheMemoryProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const std::string& hostName, const ProcessorCache& cache);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
