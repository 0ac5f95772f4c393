// One 16-bit character: a UTF-16 code unit.
#pragma once

#include <Pegasus/Common/Config.h>

namespace Pegasus {

/// Converts freely from and to its code, so that it compares with character literals. It has no
/// comparison operators of its own: they would make `c == ' '` ambiguous.
class Char16 {
  public:
    constexpr Char16() = default;
    constexpr Char16(Uint16 code) : code(code) {}

    constexpr operator Uint16() const { return code; }

  private:
    Uint16 code = 0;
};

}  // namespace Pegasus
