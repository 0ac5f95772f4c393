#pragma once

// The one error that lexer, parser and compiler of MOF raise.

#include <stdexcept>
#include <string>
#include <string_view>

#include "mof/MofPosition.h"

namespace cimomd {

/// A mistake in a MOF file. what() reads `file:line:column: found F, expected E`.
class MofError : public std::runtime_error {
  public:
    MofError(std::string_view file, MofPosition position, std::string_view found,
             std::string_view expected);

    MofPosition position() const { return position_; }

  private:
    MofPosition position_;
};

}  // namespace cimomd
