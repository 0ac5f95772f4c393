#pragma once

// What is wrong with a file, and where.

#include <cstddef>
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
    Error(Position thePosition, const std::string& theMessage)
        : std::runtime_error(std::to_string(thePosition.line) + ":" +
                             std::to_string(thePosition.column) + ": " + theMessage),
          place(thePosition),
          messageLength(theMessage.size()) {}

    Position position() const { return place; }
    // The text without the position.
    std::string message() const {
        const std::string text = what();
        return text.substr(text.size() - messageLength);
    }

  private:
    Position place;
    std::size_t messageLength;
};

}  // namespace Mif
