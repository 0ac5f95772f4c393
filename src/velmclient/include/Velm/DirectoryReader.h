// Lists the files of a directory by the end of their names.
#pragma once

#include <string>
#include <vector>

namespace Velm {

class DirectoryReader {
  public:
    // Reads the directory at once: the regular files (symbolic links followed) whose names end in
    // `pattern`, ASCII letters compared without case; an empty or null pattern fits every name. A
    // directory that cannot be read lists no files and is reported to the system log.
    DirectoryReader(const char* directory, const char* pattern);

    // How many files were found.
    int getNumberOfFiles() const;

    // The path of a file: the directory as it was given, the separator and the name. Files are
    // numbered from 0 in ascending byte order of their names; any other index gives null. The text
    // is valid as long as this object.
    const char* getFileName(int index) const;

  private:
    std::vector<std::string> paths;
};

}  // namespace Velm
