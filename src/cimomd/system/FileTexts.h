#pragma once

// Small files that were all read at once, for readers that take one value after the other.

#include <filesystem>
#include <map>
#include <string>
#include <vector>

#include "system/Fact.h"
#include "system/SystemCalls.h"

namespace cimomd {

class FileTexts {
  public:
    /// Reads the files, none of which can hang the caller.
    FileTexts(TextSource source, const std::vector<std::filesystem::path>& files,
              const SystemCalls& calls);

    // As readFact, readNumber and readSignedNumber, and a number that is 0 or 1. A file that was
    // not among those to be read is Absent.
    Fact<std::string> fact(const std::filesystem::path& file) const;
    Fact<std::uint64_t> number(const std::filesystem::path& file) const;
    Fact<std::int64_t> signedNumber(const std::filesystem::path& file) const;
    Fact<bool> switchState(const std::filesystem::path& file) const;

  private:
    std::map<std::filesystem::path, Fact<std::string>> texts;
};

}  // namespace cimomd
