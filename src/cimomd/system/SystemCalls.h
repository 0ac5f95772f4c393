#pragma once

// What only a system call tells, behind an interface, so that tests need no live machine.

#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>
#include <vector>

#include "system/Fact.h"
#include "system/network/InterfaceAddress.h"
#include "system/network/LinkSettings.h"

namespace cimomd {

/// As statvfs reports it; counts of blocks are in units of `fragmentBytes`.
struct FileSystemSize {
    std::uint64_t fragmentBytes = 0;
    std::uint64_t blocks = 0;
    std::uint64_t availableBlocks = 0;
    std::uint64_t inodes = 0;
    std::uint64_t freeInodes = 0;

    bool operator==(const FileSystemSize&) const = default;
};

inline constexpr std::size_t kMaxGuardedBytes = std::size_t{32} << 10;

/// What stands behind small files that may never answer.
enum class TextSource { Processes, NetworkDrivers, Sensors, Batteries };
inline constexpr std::size_t kTextSourceCount = 4;

class SystemCalls {
  public:
    virtual ~SystemCalls() = default;

    /// Seconds since 1970-01-01 UTC.
    virtual std::int64_t now() const = 0;
    /// Minutes that local time is ahead of UTC at `time`.
    virtual int utcOffsetMinutes(std::int64_t time) const = 0;
    /// The size of the file system mounted at `mountPoint`, a path without the injected root;
    /// nothing when it cannot be told. Call it for local file systems only: on a dead server the
    /// system call never returns.
    virtual Fact<FileSystemSize> fileSystemSize(const std::string& mountPoint) const = 0;
    /// The same for any file system, within some seconds: TimedOut when it does not answer.
    /// `device` (major:minor) tells the file system from others.
    virtual Fact<FileSystemSize> fileSystemSizeInTime(const std::string& mountPoint,
                                                      const std::string& device) const {
        static_cast<void>(device);
        return fileSystemSize(mountPoint);
    }
    /// The texts of small files behind which a driver or another process stands, in their order,
    /// of each the first kMaxGuardedBytes. TimedOut: that one did not answer within some seconds,
    /// or too many others of the same `source` did not lately.
    virtual std::vector<Fact<std::string>> textsInTime(
        TextSource source, const std::vector<std::filesystem::path>& files) const;
    /// The machine's name as uname has it, for example "x86_64".
    virtual std::optional<std::string> machine() const = 0;
    /// The internet addresses of all network interfaces, in any order.
    virtual Fact<std::vector<InterfaceAddress>> interfaceAddresses() const {
        return Absence::Absent;
    }
    /// What the driver of a network interface tells, within some seconds.
    virtual LinkSettings linkSettings(const std::string& /*interfaceName*/) const { return {}; }

  protected:
    SystemCalls() = default;
    SystemCalls(const SystemCalls&) = default;
    SystemCalls& operator=(const SystemCalls&) = default;
};

}  // namespace cimomd
