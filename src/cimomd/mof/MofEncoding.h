#pragma once

// The encodings in which MOF files are found.

#include <string>

namespace cimomd {

/// The text of a file as UTF-8. A byte-order mark tells UTF-16; halves of characters that have no
/// other half become U+FFFD. All else is returned as it is.
std::string utf8TextOf(std::string bytes);

}  // namespace cimomd
