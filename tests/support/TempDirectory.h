#pragma once

// A fresh directory, removed with all it holds at the end of its life.

#include <string>

namespace support {

class TempDirectory {
  public:
    // Throws std::runtime_error when no directory can be made.
    TempDirectory();
    ~TempDirectory();
    TempDirectory(const TempDirectory&) = delete;
    TempDirectory& operator=(const TempDirectory&) = delete;

    // Absolute, without a slash at its end.
    const std::string& path() const { return path_; }
    // The path of a name below it.
    std::string file(const std::string& name) const { return path_ + "/" + name; }

  private:
    std::string path_;
};

}  // namespace support
