#pragma once

// What is wrong with a file, and where.

#include <stdexcept>
#include <string>

namespace Mif {

// Both count from 1; a line ends at LF, a column is an octet.
struct Position {
    unsigned int line = 1;
    unsigned int column = 1;
};

// The text reads "line:column: message".
class Error : public std::runtime_error {
  public:
    Error(Position position, const std::string& message)
        : std::runtime_error(std::to_string(position.line) + ":" + std::to_string(position.column) +
                             ": " + message) {}
};

}  // namespace Mif
