// Reads what encloses every CIM-XML message: CIM and MESSAGE.

#pragma once

#include <string>

#include "xml/ElementReader.h"

namespace Pegasus {

/// A message of another major version than 2 (CIMVERSION, DTDVERSION) or 1 (PROTOCOLVERSION).
struct UnsupportedVersion {
    enum class What { Cim, Dtd, Protocol };
    What what;
    std::string message;
};

/// Enters the root CIM and then MESSAGE, whose ID it returns. Throws XmlError, and
/// UnsupportedVersion when a version is another.
std::string readMessageHead(ElementReader& reader);

/// Leaves MESSAGE and CIM, which must hold nothing else, and reads the document to its end.
void readMessageEnd(ElementReader& reader);

}  // namespace Pegasus
