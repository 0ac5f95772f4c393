#pragma once

// The running operating system. Reads os-release, the kernel's release, memory and boot time, the
// session records and the number of process directories.

#include <optional>
#include <string>

#include "providers/Provider.h"
#include "system/SystemCalls.h"
#include "system/SystemPaths.h"
#include "system/software/KernelTables.h"
#include "system/software/OsRelease.h"

namespace cimomd {

/// What the machine says about its operating system.
struct OperatingSystemFacts {
    std::string hostName;
    OsRelease release;
    Fact<std::string> kernelRelease;
    /// As uname names it.
    Fact<std::string> machine;
    MemoryInfo memory;
    Fact<std::int64_t> bootTime;
    std::int64_t now = 0;
    int utcOffsetMinutes = 0;
    int utcOffsetAtBootMinutes = 0;
    Fact<std::uint32_t> processes;
    Fact<std::uint32_t> sessions;
};

class OperatingSystemProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_OperatingSystem";

    /// `systemCalls` must outlive the provider.
    OperatingSystemProvider(SystemPaths systemPaths, const SystemCalls& systemCalls)
        : paths(std::move(systemPaths)), calls(systemCalls) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    static ProvidedInstance publish(const OperatingSystemFacts& facts);

    /// CIM_OperatingSystem.OSType of a distribution's ID on that machine; nothing when the machine
    /// is unknown.
    static std::optional<std::uint16_t> osTypeOf(const std::optional<std::string>& id,
                                                 const std::optional<std::string>& machine);

  private:
    OperatingSystemFacts read() const;

    SystemPaths paths;
    const SystemCalls& calls;
};

}  // namespace cimomd
