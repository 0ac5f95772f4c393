#pragma once

// UTF-8 for texts of doubtful origin: kernel files, firmware tables, foreign MOF files.

#include <string>
#include <string_view>

#include "xml/XmlCharacters.h"

namespace cimomd {

using Pegasus::equalsIgnoringCase;

/// `bytes` with U+FFFD in place of every byte that is not part of well-formed UTF-8 and of control
/// characters other than tab, LF and CR: what CIM-XML can carry.
std::string cleanText(std::string_view bytes);

/// The same without a copy of what is clean already: the result is `bytes` then, and otherwise in
/// `room`.
std::string_view cleanText(std::string_view bytes, std::string& room);

/// At most `maxCharacters` characters from the front of well-formed UTF-8, counted in UTF-16 units
/// as MaxLen counts them.
std::string_view firstCharacters(std::string_view text, std::size_t maxCharacters);

/// `text` with its ASCII letters in lower case.
std::string lowerCase(std::string_view text);

/// `text` without the ASCII white space (and NUL bytes) at both ends.
std::string_view trimmed(std::string_view text);

}  // namespace cimomd
