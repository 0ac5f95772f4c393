// Turns the octets of an XML text into the characters they stand for, in place.

#pragma once

#include <string>

namespace Pegasus {

/// Which rules hold: line ends become LF in all of them (XML 1.0, 2.11); references are replaced
/// except in CDATA sections; in attribute values all white space becomes blanks (3.3.3).
enum class XmlTextKind { Content, CData, Attribute };

/// Why a text cannot be decoded; `place` points at the fault.
struct XmlTextFault {
    const char* place;
    std::string message;
};

/// Decodes the octets from `begin` to `end` and returns their new end: nothing that is replaced is
/// shorter than its replacement. Throws XmlTextFault for a reference to nothing.
char* decodeXmlText(char* begin, const char* end, XmlTextKind kind);

}  // namespace Pegasus
