#pragma once

// Asking for the size of a file system that may never answer. On a dead server, or with a FUSE
// program that hangs, statfs never returns, and no signal ends it. So a child process asks: what it
// did not tell by a deadline is not known.

#include <sys/types.h>

#include <chrono>
#include <cstddef>
#include <map>
#include <mutex>
#include <string>
#include <vector>

#include "system/Fact.h"
#include "system/SystemCalls.h"

namespace cimomd {

/// The size as statfs tells it: 0, or the error number and `size` as it was. May block for ever.
/// Safe between fork and exec of a process with threads.
int readFileSystemSize(const char* mountPoint, FileSystemSize& size);

/// What an error number of `readFileSystemSize` says about the value.
Absence absenceOfSize(int error);

class FileSystemSizeGuard {
  public:
    /// Like `readFileSystemSize`.
    using Call = int (*)(const char* mountPoint, FileSystemSize& size);

    struct Limits {
        /// How long an answer is waited for.
        std::chrono::milliseconds deadline{2000};
        /// How long a file system that did not answer is left alone.
        std::chrono::milliseconds retryAfter{60000};
        /// While so many do not answer, no other is asked: it bounds the time of one enumeration
        /// and the number of children that even SIGKILL does not end.
        std::size_t maxSilent = 5;
    };

    explicit FileSystemSizeGuard(Call sizeCall = readFileSystemSize)
        : FileSystemSizeGuard(sizeCall, Limits()) {}
    FileSystemSizeGuard(Call sizeCall, const Limits& bounds) : call(sizeCall), limits(bounds) {}
    FileSystemSizeGuard(const FileSystemSizeGuard&) = delete;
    FileSystemSizeGuard& operator=(const FileSystemSizeGuard&) = delete;

    /// The size of the file system with the number `device` (major:minor) that is mounted at
    /// `mountPoint`; TimedOut when it does not answer in time, or was not asked because it or too
    /// many others did not answer before. May be called from several threads at once.
    Fact<FileSystemSize> ask(const std::string& device, const std::string& mountPoint);

  private:
    using Clock = std::chrono::steady_clock;

    bool mayAsk(const std::string& device);
    void noteSilence(const std::string& device);
    void end(pid_t child);

    Call call;
    Limits limits;
    std::mutex mutex;
    /// When a silent file system may be asked again.
    std::map<std::string, Clock::time_point> retryTimes;
    /// Killed, but not gone yet.
    std::vector<pid_t> stuck;
};

}  // namespace cimomd
