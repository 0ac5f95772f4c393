#pragma once

// Asking for the size of a file system that may never answer. On a dead server, or with a FUSE
// program that hangs, statfs never returns: a guarded child asks.

#include <string>

#include "system/Fact.h"
#include "system/SilentSources.h"
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
    using Limits = SilenceLimits;

    explicit FileSystemSizeGuard(Call sizeCall = readFileSystemSize, const Limits& bounds = {})
        : call(sizeCall), silent(bounds) {}

    /// The size of the file system with the number `device` (major:minor) that is mounted at
    /// `mountPoint`; TimedOut when it does not answer in time, or was not asked because it or too
    /// many others did not answer before. May be called from several threads at once.
    Fact<FileSystemSize> ask(const std::string& device, const std::string& mountPoint);

  private:
    Call call;
    SilentSources silent;
};

}  // namespace cimomd
