#pragma once

// Stands in for the system calls when a recorded tree is read: the sizes of its file systems, its
// addresses and what its network drivers tell come from files of the tree, never from the machine
// this runs on.

#include <map>
#include <string_view>

#include "system/LiveSystemCalls.h"
#include "system/SystemPaths.h"

namespace cimomd {

/// Reads lines `mount-point fragment-bytes blocks available-blocks inodes free-inodes`, and
/// `mount-point timeout` of a file system that did not answer; blanks in the mount point are
/// written as \040. Other lines are dropped.
std::map<std::string, Fact<FileSystemSize>> parseRecordedSizes(std::string_view text);

class RecordedSystemCalls : public LiveSystemCalls {
  public:
    explicit RecordedSystemCalls(const SystemPaths& paths);

    Fact<FileSystemSize> fileSystemSize(const std::string& mountPoint) const override;
    Fact<FileSystemSize> fileSystemSizeInTime(const std::string& mountPoint,
                                              const std::string& device) const override;
    /// Always nothing: a tree says it in proc/sys/kernel/arch or not at all.
    std::optional<std::string> machine() const override;
    Fact<std::vector<InterfaceAddress>> interfaceAddresses() const override;
    LinkSettings linkSettings(const std::string& interfaceName) const override;

  private:
    std::map<std::string, Fact<FileSystemSize>> sizes;
    Fact<std::vector<InterfaceAddress>> addresses;
    std::map<std::string, LinkSettings> links;
};

}  // namespace cimomd
