#pragma once

// The statements that one block has had so far.

#include <map>
#include <string>

#include "mifreader/Error.h"

namespace Mif {

class Statements {
  public:
    // A block that began at the position; its name is for messages.
    Statements(std::string theBlock, Position theStart)
        : block(std::move(theBlock)), start(theStart) {}

    // Notes a statement by its word. Throws Error when the block has it already.
    void note(const std::string& word, Position position) {
        if (!seen.emplace(word, position).second) {
            throw Error(position, "second statement '" + word + "' in this " + block);
        }
    }
    bool has(const std::string& word) const { return seen.count(word) != 0; }

    // Throws Error at the block's start when a statement is missing.
    void require(const std::string& word) const {
        if (!has(word)) {
            throw Error(start, block + " without '" + word + "'");
        }
    }
    [[noreturn]] void refuse(const std::string& word, Position position) const {
        throw Error(position, "no statement of this " + block + ": '" + word + "'");
    }

  private:
    std::string block;
    Position start;
    std::map<std::string, Position> seen;
};

}  // namespace Mif
