#include "ObjectXml.h"

#include <Pegasus/Common/CIMFlavor.h>
#include <Pegasus/Common/CIMQualifier.h>

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

namespace {

template <typename Owner>
void appendQualifiers(std::string& xml, const Owner& owner, const ObjectXmlOptions& options) {
    if (!options.includeQualifiers) {
        return;
    }
    for (Uint32 i = 0; i < owner.getQualifierCount(); ++i) {
        const CIMConstQualifier qualifier = owner.getQualifier(i);
        if (!options.localOnly || !qualifier.getPropagated()) {
            appendQualifier(xml, qualifier);
        }
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

void appendProperty(std::string& xml, const CIMConstProperty& property,
                    const ObjectXmlOptions& options) {
    const std::string_view element = propertyElement(property);
    xml.append("<").append(element);
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
    appendValue(xml, property.getValue());
    xml.append("</").append(element).append(">");
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

template <typename Owner>
void appendProperties(std::string& xml, const Owner& owner, const ObjectXmlOptions& options) {
    for (Uint32 i = 0; i < owner.getPropertyCount(); ++i) {
        const CIMConstProperty property = owner.getProperty(i);
        if (isWanted(property, options)) {
            appendProperty(xml, property, options);
        }
    }
}

}  // namespace

void appendClassElement(std::string& xml, const CIMConstClass& cimClass) {
    beginClassElement(xml, cimClass, ObjectXmlOptions());
    endClassElement(xml);
}

void beginClassElement(std::string& xml, const CIMConstClass& cimClass,
                       const ObjectXmlOptions& options) {
    xml += "<CLASS";
    appendAttribute(xml, "NAME", cimClass.getClassName().getString());
    if (!cimClass.getSuperClassName().isNull()) {
        appendAttribute(xml, "SUPERCLASS", cimClass.getSuperClassName().getString());
    }
    xml += '>';
    appendQualifiers(xml, cimClass, options);
    appendProperties(xml, cimClass, options);
}

void endClassElement(std::string& xml) {
    xml += "</CLASS>";
}

void appendInstance(std::string& xml, const CIMConstInstance& instance,
                    const ObjectXmlOptions& options) {
    xml += "<INSTANCE";
    appendAttribute(xml, "CLASSNAME", instance.getClassName().getString());
    xml += '>';
    appendQualifiers(xml, instance, options);
    appendProperties(xml, instance, options);
    xml += "</INSTANCE>";
}

void appendObject(std::string& xml, const CIMObject& object) {
    if (object.isUninitialized()) {
        return;
    }
    if (object.isClass()) {
        appendClassElement(xml, CIMConstClass(object));
    } else {
        appendInstance(xml, CIMConstInstance(object));
    }
}

}  // namespace Pegasus
