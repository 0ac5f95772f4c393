#pragma once

// The system calls of the machine this runs on.

#include "system/FileReadGuard.h"
#include "system/SystemCalls.h"
#include "system/network/LinkSettingsGuard.h"
#include "system/storage/FileSystemSizeGuard.h"

namespace cimomd {

class LiveSystemCalls : public SystemCalls {
  public:
    std::int64_t now() const override;
    int utcOffsetMinutes(std::int64_t time) const override;
    Fact<FileSystemSize> fileSystemSize(const std::string& mountPoint) const override;
    Fact<FileSystemSize> fileSystemSizeInTime(const std::string& mountPoint,
                                              const std::string& device) const override;
    std::vector<Fact<std::string>> textsInTime(
        const std::vector<std::filesystem::path>& wanted) const override;
    std::optional<std::string> machine() const override;
    Fact<std::vector<InterfaceAddress>> interfaceAddresses() const override;
    LinkSettings linkSettings(const std::string& interfaceName) const override;

  private:
    mutable FileSystemSizeGuard sizes;
    mutable FileReadGuard files;
    mutable LinkSettingsGuard links;
};

}  // namespace cimomd
