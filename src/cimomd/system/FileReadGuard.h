#pragma once

// Reading small files behind which a driver or another process stands, and may hang: a guarded
// child reads them all and sends the bytes.

#include <filesystem>
#include <string>
#include <vector>

#include "files/BoundedFile.h"
#include "system/Fact.h"
#include "system/SilentSources.h"
#include "system/SystemCalls.h"

namespace cimomd {

class FileReadGuard {
  public:
    /// Like `readFileStart`, and as safe between fork and exec.
    using Call = FileStatus (*)(const char* path, char* buffer, std::size_t capacity,
                                std::size_t& length);

    explicit FileReadGuard(Call readCall = readFileStart, const SilenceLimits& bounds = {})
        : call(readCall), silent(bounds) {}

    /// The texts of `files` in their order, of each the first kMaxGuardedBytes. TimedOut: the file
    /// did not answer in time, or was not asked because another one of its directory or too many
    /// others did not answer before. May be called from several threads at once.
    std::vector<Fact<std::string>> read(const std::vector<std::filesystem::path>& files);

  private:
    using Texts = std::vector<Fact<std::string>>;

    std::vector<std::size_t> askable(const std::vector<std::filesystem::path>& files,
                                     std::size_t first);
    std::size_t readOn(const std::vector<std::filesystem::path>& files,
                       const std::vector<std::size_t>& wanted, Texts& texts);

    Call call;
    SilentSources silent;
};

}  // namespace cimomd
