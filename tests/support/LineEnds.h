#pragma once

// Line ends of expected texts.

#include <string>

namespace support {

// The text with CR LF in place of every LF.
std::string crlf(const std::string& text);

}  // namespace support
