// UTF-8 (RFC 3629) to and from the 16-bit characters of String.
#pragma once

#include <Pegasus/Common/Char16.h>

#include <cstddef>
#include <string>

namespace Pegasus {

Boolean isAscii(const char* bytes, std::size_t n);

/// How many 16-bit characters `n` bytes of UTF-8 make, or would if they were valid.
std::size_t utf16Length(const char* bytes, std::size_t n);

/// Writes at most utf16Length() characters to `out`. Returns `n`, or the offset of the first byte
/// of the first sequence that is not UTF-8.
std::size_t decodeUtf8(const char* bytes, std::size_t n, Char16* out);

/// A surrogate without its partner becomes U+FFFD.
std::string encodeUtf8(const Char16* text, std::size_t n);

}  // namespace Pegasus
