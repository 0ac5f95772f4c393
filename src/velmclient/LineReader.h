// Buffered reading of a text file's lines.
#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "velmclient/FileDescriptor.h"

namespace Velm {

class LineReader {
  public:
    // Reads from an open file; the path serves messages only.
    LineReader(FileDescriptor file, std::string path);

    // As TextFile::readLine, with a valid buffer and a limit of at least 0.
    int readLine(char* line, int limit);

  private:
    // Makes at least one unread byte available; false at the end of the file or on an error.
    bool fill();

    FileDescriptor file;
    std::string path;
    std::vector<char> buffer;
    std::size_t begin = 0;
    std::size_t end = 0;
    bool failed = false;
};

}  // namespace Velm
