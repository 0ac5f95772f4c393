#include "xml/DecodeContext.h"

#include "xml/XmlCharacters.h"

namespace Pegasus {

const CIMName& DecodeContext::requiredName(const ElementReader& reader,
                                           std::string_view attributeName) {
    const std::string_view text = reader.requiredAttribute(attributeName);
    const CIMName* name = names.find(text);
    if (name == nullptr) {
        reader.fail("attribute " + std::string(attributeName) + " of element " +
                    quotedForMessage(reader.name()) + " is " + quotedForMessage(text) +
                    "; expected a CIM name");
    }
    return *name;
}

CIMName DecodeContext::optionalName(const ElementReader& reader, std::string_view attributeName) {
    return reader.attribute(attributeName) ? requiredName(reader, attributeName) : CIMName();
}

std::string DecodeContext::place() const {
    std::string place;
    if (propertyName != nullptr) {
        place += "; in property ";
        place += propertyName->getString().getCString();
    }
    if (className != nullptr) {
        place += place.empty() ? "; in class " : " of class ";
        place += className->getString().getCString();
    }
    return place;
}

}  // namespace Pegasus
