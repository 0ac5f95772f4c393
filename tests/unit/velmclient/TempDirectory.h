// A directory of its own for a test, gone with the object.
#pragma once

#include <string>
#include <string_view>
#include <vector>

class TempDirectory {
  public:
    // Throws std::runtime_error when the directory cannot be made.
    TempDirectory();
    ~TempDirectory();
    TempDirectory(const TempDirectory&) = delete;
    TempDirectory& operator=(const TempDirectory&) = delete;

    // The directory, or the path of a name in it; no "/" at the end.
    std::string path(std::string_view name = {}) const;

    // Writes a file of that name and returns its path.
    std::string write(std::string_view name, std::string_view bytes) const;

    // The bytes of the file of that name; throws std::runtime_error when there is none.
    std::string read(std::string_view name) const;

    // All names in the directory, hidden ones too, sorted.
    std::vector<std::string> names() const;

  private:
    std::string root;
};
