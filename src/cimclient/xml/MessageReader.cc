#include "xml/MessageReader.h"

#include <string_view>

#include "xml/XmlCharacters.h"

namespace Pegasus {

namespace {

// Minor versions add elements and attributes only, so the major number decides.
void requireVersion(const ElementReader& reader, std::string_view attributeName, char major,
                    UnsupportedVersion::What what) {
    const std::string_view version = reader.requiredAttribute(attributeName);
    const bool isSupported =
        version.starts_with(major) && (version.size() == 1 || version[1] == '.');
    if (!isSupported) {
        throw UnsupportedVersion{what, std::string(attributeName) + " is " +
                                           quotedForMessage(version) + "; expected " + major +
                                           ".x"};
    }
}

}  // namespace

std::string readMessageHead(ElementReader& reader) {
    reader.readRoot();
    if (!reader.is("CIM")) {
        reader.failUnexpected("CIM");
    }
    requireVersion(reader, "CIMVERSION", '2', UnsupportedVersion::What::Cim);
    requireVersion(reader, "DTDVERSION", '2', UnsupportedVersion::What::Dtd);
    reader.requireChildNamed("MESSAGE");
    requireVersion(reader, "PROTOCOLVERSION", '1', UnsupportedVersion::What::Protocol);
    return std::string(reader.requiredAttribute("ID"));
}

void readMessageEnd(ElementReader& reader) {
    reader.readEnd();
    reader.readEnd();
    reader.readDocumentEnd();
}

}  // namespace Pegasus
