#include "mof/MofError.h"

#include <fmt/format.h>

namespace cimomd {

MofError::MofError(std::string_view file, MofPosition position, std::string_view found,
                   std::string_view expected)
    : std::runtime_error(fmt::format("{}:{}:{}: found {}, expected {}", file, position.line,
                                     position.column, found, expected)),
      position_(position) {}

}  // namespace cimomd
