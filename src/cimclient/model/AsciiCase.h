// Upper and lower case of the ASCII letters: the case that CIM names ignore, in any locale.
#pragma once

#include <Pegasus/Common/Char16.h>

namespace Pegasus {

constexpr Uint16 toAsciiLower(Uint16 code) {
    return code >= 'A' && code <= 'Z' ? static_cast<Uint16>(code + ('a' - 'A')) : code;
}

constexpr Uint16 toAsciiUpper(Uint16 code) {
    return code >= 'a' && code <= 'z' ? static_cast<Uint16>(code - ('a' - 'A')) : code;
}

}  // namespace Pegasus
