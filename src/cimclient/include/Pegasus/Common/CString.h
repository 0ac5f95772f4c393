// The UTF-8 form of a String.
#pragma once

#include <string>
#include <utility>

namespace Pegasus {

/// Owns its bytes: the pointer it converts to lives as long as this object does.
class CString {
  public:
    CString() = default;
    explicit CString(std::string utf8) : bytes(std::move(utf8)) {}

    /// NUL-terminated UTF-8.
    operator const char*() const { return bytes.c_str(); }

  private:
    std::string bytes;
};

}  // namespace Pegasus
