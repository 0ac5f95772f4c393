#pragma once

// The processes. Reads /proc/PID, one process at a time.

#include "providers/Provider.h"
#include "system/SystemCalls.h"
#include "system/SystemPaths.h"
#include "system/software/ProcessTable.h"

namespace cimomd {

/// What all processes of one enumeration have in common.
struct ProcessSurroundings {
    std::string hostName;
    std::string osName;
    /// The start of the machine in seconds since 1970 UTC.
    Fact<std::int64_t> bootTime;
    int utcOffsetMinutes = 0;
};

class UnixProcessProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_UnixProcess";

    /// `systemCalls` must outlive the provider.
    UnixProcessProvider(SystemPaths systemPaths, const SystemCalls& systemCalls)
        : paths(std::move(systemPaths)), calls(systemCalls) {}

    const char* className() const override { return kClassName; }
    /// Processes that end meanwhile are left out, those that begin are not waited for.
    std::unique_ptr<InstanceStream> enumerate() const override;

    /// `userName` of the real user.
    static ProvidedInstance publish(const ProcessSurroundings& surroundings, const Process& process,
                                    const Fact<std::string>& userName);

  private:
    SystemPaths paths;
    const SystemCalls& calls;
};

}  // namespace cimomd
