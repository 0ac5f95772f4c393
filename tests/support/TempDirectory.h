#pragma once

// A fresh directory, removed with all it holds at the end of its life.

#include <string>
#include <string_view>
#include <vector>

namespace support {

class TempDirectory {
  public:
    // Throws std::runtime_error when no directory can be made.
    TempDirectory();
    ~TempDirectory();
    TempDirectory(const TempDirectory&) = delete;
    TempDirectory& operator=(const TempDirectory&) = delete;

    // Absolute, of the directory or of a name below it; without a slash at its end.
    std::string path(std::string_view name = {}) const;

    // Makes or replaces the file of that name and returns its path; throws std::runtime_error on
    // failure.
    std::string write(std::string_view name, std::string_view bytes) const;

    // The bytes of the file of that name; throws std::runtime_error when there is none.
    std::string read(std::string_view name) const;

    // All names in the directory, hidden ones too, in byte order.
    std::vector<std::string> names() const;

  private:
    std::string root;
};

}  // namespace support
