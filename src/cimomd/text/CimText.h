#pragma once

// Between the client library's 16-bit strings and UTF-8.

#include <Pegasus/Common/CString.h>
#include <Pegasus/Common/String.h>

#include <string>
#include <string_view>

namespace cimomd {

inline std::string utf8Of(const Pegasus::String& text) {
    return static_cast<const char*>(text.getCString());
}

/// `utf8` must be well-formed (utf8::clean); raises Pegasus::Exception otherwise.
inline Pegasus::String cimString(std::string_view utf8) {
    return Pegasus::String(utf8.data(), static_cast<Pegasus::Uint32>(utf8.size()));
}

}  // namespace cimomd
