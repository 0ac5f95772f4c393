#include "PropertyXml.h"

#include <Pegasus/Common/CIMFlavor.h>

#include <string_view>

#include "XmlText.h"

namespace Pegasus {

namespace {

bool isEmbedded(CIMType type) {
    return type == CIMTYPE_OBJECT || type == CIMTYPE_INSTANCE;
}

std::string_view typeAttribute(CIMType type) {
    return cimTypeToString(isEmbedded(type) ? CIMTYPE_STRING : type);
}

// What is written only where it differs from what a reader assumes.
void appendFlag(std::string& xml, std::string_view name, Boolean value, Boolean assumed) {
    if (value != assumed) {
        appendAttribute(xml, name, std::string_view(value ? "true" : "false"));
    }
}

std::string_view propertyElement(const CIMConstProperty& property) {
    if (property.getType() == CIMTYPE_REFERENCE) {
        return property.isArray() ? "PROPERTY.REFARRAY" : "PROPERTY.REFERENCE";
    }
    return property.isArray() ? "PROPERTY.ARRAY" : "PROPERTY";
}

void appendTypeAttributes(std::string& xml, const CIMConstProperty& property) {
    const CIMType type = property.getType();
    if (type != CIMTYPE_REFERENCE) {
        appendAttribute(xml, "TYPE", typeAttribute(type));
    }
    if (!property.getReferenceClassName().isNull()) {
        appendAttribute(xml, "REFERENCECLASS", property.getReferenceClassName().getString());
    }
    if (property.getArraySize() != 0) {
        appendAttribute(xml, "ARRAYSIZE",
                        std::string_view(std::to_string(property.getArraySize())));
    }
}

}  // namespace

void appendQualifier(std::string& xml, const CIMConstQualifier& qualifier) {
    const CIMFlavor& flavor = qualifier.getFlavor();
    xml += "<QUALIFIER";
    appendAttribute(xml, "NAME", qualifier.getName().getString());
    appendAttribute(xml, "TYPE", typeAttribute(qualifier.getType()));
    appendFlag(xml, "PROPAGATED", qualifier.getPropagated(), false);
    appendFlag(xml, "OVERRIDABLE", flavor.has(CIMFlavor::OVERRIDABLE), true);
    appendFlag(xml, "TOSUBCLASS", flavor.has(CIMFlavor::TOSUBCLASS), true);
    appendFlag(xml, "TOINSTANCE", flavor.has(CIMFlavor::TOINSTANCE), false);
    appendFlag(xml, "TRANSLATABLE", flavor.has(CIMFlavor::TRANSLATABLE), false);
    xml += '>';
    appendValue(xml, qualifier.getValue());
    xml += "</QUALIFIER>";
}

bool isWanted(const CIMConstProperty& property, const ObjectXmlOptions& options) {
    if (options.localOnly && property.getPropagated()) {
        return false;
    }
    if (options.propertyList.isNull()) {
        return true;
    }
    for (const CIMName& name : options.propertyList.getPropertyNameArray()) {
        if (name.equal(property.getName())) {
            return true;
        }
    }
    return false;
}

void beginProperty(std::string& xml, const CIMConstProperty& property,
                   const ObjectXmlOptions& options) {
    xml.append("<").append(propertyElement(property));
    appendAttribute(xml, "NAME", property.getName().getString());
    appendTypeAttributes(xml, property);
    if (options.includeClassOrigin && !property.getClassOrigin().isNull()) {
        appendAttribute(xml, "CLASSORIGIN", property.getClassOrigin().getString());
    }
    appendFlag(xml, "PROPAGATED", property.getPropagated(), false);
    if (isEmbedded(property.getType())) {
        appendAttribute(xml, "EmbeddedObject",
                        std::string_view(cimTypeToString(property.getType())));
    }
    xml += '>';
    appendQualifiers(xml, property, options);
}

void endProperty(std::string& xml, const CIMConstProperty& property) {
    xml.append("</").append(propertyElement(property)).append(">");
}

}  // namespace Pegasus
