#pragma once

// The mistakes that compiling MOF files finds: one, and all of a compilation.

#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

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

/// Why a compilation failed. what() has one line for each mistake.
class MofErrors : public std::runtime_error {
  public:
    /// `errors` is not empty. `isCut` says that there may be more mistakes.
    MofErrors(std::vector<MofError> errors, bool isCut);

    const std::vector<MofError>& errors() const { return errors_; }

  private:
    std::vector<MofError> errors_;
};

}  // namespace cimomd
