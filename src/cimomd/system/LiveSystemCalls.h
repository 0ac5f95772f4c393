#pragma once

// The system calls of the machine this runs on.

#include <array>

#include "system/FileReadGuard.h"
#include "system/SilentSources.h"
#include "system/SystemCalls.h"
#include "system/network/LinkSettingsGuard.h"
#include "system/storage/FileSystemSizeGuard.h"

namespace cimomd {

class LiveSystemCalls : public SystemCalls {
  public:
    /// `silence` bounds the waiting for files, for each kind of source by itself.
    explicit LiveSystemCalls(const SilenceLimits& silence = {});

    std::int64_t now() const override;
    int utcOffsetMinutes(std::int64_t time) const override;
    Fact<FileSystemSize> fileSystemSize(const std::string& mountPoint) const override;
    Fact<FileSystemSize> fileSystemSizeInTime(const std::string& mountPoint,
                                              const std::string& device) const override;
    std::vector<Fact<std::string>> textsInTime(
        TextSource source, const std::vector<std::filesystem::path>& wanted) const override;
    std::optional<std::string> machine() const override;
    Fact<std::vector<InterfaceAddress>> interfaceAddresses() const override;
    LinkSettings linkSettings(const std::string& interfaceName) const override;

  private:
    mutable FileSystemSizeGuard sizes;
    /// By TextSource: any user can make processes that hang, and must silence nothing else by it.
    mutable std::array<FileReadGuard, kTextSourceCount> files;
    mutable LinkSettingsGuard links;
};

}  // namespace cimomd
