#include "xml/CimXmlWriter.h"

#include <Pegasus/Common/CIMFlavor.h>
#include <Pegasus/Common/CIMQualifier.h>

#include "xml/XmlText.h"

namespace Pegasus {

namespace {

constexpr std::string_view kMessageHead =
    "<?xml version=\"1.0\" encoding=\"utf-8\"?>\n"
    "<CIM CIMVERSION=\"2.0\" DTDVERSION=\"2.0\"><MESSAGE";

void beginMessage(std::string& xml, std::string_view messageId) {
    xml += kMessageHead;
    appendAttribute(xml, "ID", messageId);
    xml += " PROTOCOLVERSION=\"1.0\">";
}

void endMessage(std::string& xml) {
    xml += "</MESSAGE></CIM>\n";
}

void appendFlagParameter(std::string& xml, std::string_view name, Boolean value) {
    xml += "<IPARAMVALUE";
    appendAttribute(xml, "NAME", name);
    xml += value ? "><VALUE>TRUE</VALUE></IPARAMVALUE>" : "><VALUE>FALSE</VALUE></IPARAMVALUE>";
}

void appendListParameter(std::string& xml, const CIMPropertyList& propertyList) {
    if (propertyList.isNull()) {
        return;
    }
    xml += "<IPARAMVALUE NAME=\"PropertyList\"><VALUE.ARRAY>";
    for (const CIMName& name : propertyList.getPropertyNameArray()) {
        xml += "<VALUE>";
        appendEscaped(xml, name.getString());
        xml += "</VALUE>";
    }
    xml += "</VALUE.ARRAY></IPARAMVALUE>";
}

void beginCall(std::string& xml, std::string_view messageId, std::string_view method,
               const CIMNamespaceName& nameSpace, const CIMName& className) {
    beginMessage(xml, messageId);
    xml += "<SIMPLEREQ><IMETHODCALL";
    appendAttribute(xml, "NAME", method);
    xml += '>';
    appendLocalNamespacePath(xml, nameSpace);
    xml += "<IPARAMVALUE NAME=\"ClassName\">";
    appendClassName(xml, className);
    xml += "</IPARAMVALUE>";
}

void endCall(std::string& xml) {
    xml += "</IMETHODCALL></SIMPLEREQ>";
    endMessage(xml);
}

// What is written only where it differs from what a reader assumes.
void appendFlag(std::string& xml, std::string_view name, Boolean value, Boolean assumed) {
    if (value != assumed) {
        appendAttribute(xml, name, std::string_view(value ? "true" : "false"));
    }
}

void appendQualifier(std::string& xml, const CIMConstQualifier& qualifier) {
    const CIMFlavor& flavor = qualifier.getFlavor();
    xml += "<QUALIFIER";
    appendAttribute(xml, "NAME", qualifier.getName().getString());
    appendAttribute(xml, "TYPE", std::string_view(cimTypeToString(qualifier.getType())));
    appendFlag(xml, "PROPAGATED", qualifier.getPropagated(), false);
    appendFlag(xml, "OVERRIDABLE", flavor.has(CIMFlavor::OVERRIDABLE), true);
    appendFlag(xml, "TOSUBCLASS", flavor.has(CIMFlavor::TOSUBCLASS), true);
    appendFlag(xml, "TOINSTANCE", flavor.has(CIMFlavor::TOINSTANCE), false);
    appendFlag(xml, "TRANSLATABLE", flavor.has(CIMFlavor::TRANSLATABLE), false);
    xml += '>';
    appendValue(xml, qualifier.getValue());
    xml += "</QUALIFIER>";
}

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
    if (type == CIMTYPE_REFERENCE) {
        if (!property.getReferenceClassName().isNull()) {
            appendAttribute(xml, "REFERENCECLASS", property.getReferenceClassName().getString());
        }
    } else if (type == CIMTYPE_OBJECT || type == CIMTYPE_INSTANCE) {
        appendAttribute(xml, "TYPE", std::string_view("string"));
        appendAttribute(xml, "EmbeddedObject",
                        std::string_view(type == CIMTYPE_INSTANCE ? "instance" : "object"));
    } else {
        appendAttribute(xml, "TYPE", std::string_view(cimTypeToString(type)));
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

std::string encodeGetClassRequest(std::string_view messageId, const CIMNamespaceName& nameSpace,
                                  const CIMName& className, Boolean localOnly,
                                  Boolean includeQualifiers, Boolean includeClassOrigin,
                                  const CIMPropertyList& propertyList) {
    std::string xml;
    beginCall(xml, messageId, "GetClass", nameSpace, className);
    appendFlagParameter(xml, "LocalOnly", localOnly);
    appendFlagParameter(xml, "IncludeQualifiers", includeQualifiers);
    appendFlagParameter(xml, "IncludeClassOrigin", includeClassOrigin);
    appendListParameter(xml, propertyList);
    endCall(xml);
    return xml;
}

std::string encodeEnumerateInstancesRequest(std::string_view messageId,
                                            const CIMNamespaceName& nameSpace,
                                            const CIMName& className, Boolean deepInheritance,
                                            Boolean localOnly, Boolean includeQualifiers,
                                            Boolean includeClassOrigin,
                                            const CIMPropertyList& propertyList) {
    std::string xml;
    beginCall(xml, messageId, "EnumerateInstances", nameSpace, className);
    appendFlagParameter(xml, "LocalOnly", localOnly);
    appendFlagParameter(xml, "DeepInheritance", deepInheritance);
    appendFlagParameter(xml, "IncludeQualifiers", includeQualifiers);
    appendFlagParameter(xml, "IncludeClassOrigin", includeClassOrigin);
    appendListParameter(xml, propertyList);
    endCall(xml);
    return xml;
}

void beginResponse(std::string& xml, std::string_view messageId, std::string_view method) {
    beginMessage(xml, messageId);
    xml += "<SIMPLERSP><IMETHODRESPONSE";
    appendAttribute(xml, "NAME", method);
    xml += '>';
}

void endResponse(std::string& xml) {
    xml += "</IMETHODRESPONSE></SIMPLERSP>";
    endMessage(xml);
}

void beginReturnValue(std::string& xml) {
    xml += "<IRETURNVALUE>";
}

void endReturnValue(std::string& xml) {
    xml += "</IRETURNVALUE>";
}

void appendError(std::string& xml, Uint32 code, const String& description) {
    xml += "<ERROR";
    appendAttribute(xml, "CODE", std::string_view(std::to_string(code)));
    appendAttribute(xml, "DESCRIPTION", description);
    xml += "/>";
}

void appendClass(std::string& xml, const CIMConstClass& cimClass, const ObjectXmlOptions& options) {
    xml += "<CLASS";
    appendAttribute(xml, "NAME", cimClass.getClassName().getString());
    if (!cimClass.getSuperClassName().isNull()) {
        appendAttribute(xml, "SUPERCLASS", cimClass.getSuperClassName().getString());
    }
    xml += '>';
    appendQualifiers(xml, cimClass, options);
    appendProperties(xml, cimClass, options);
    xml += "</CLASS>\n";
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

void appendNamedInstance(std::string& xml, const CIMConstInstance& instance,
                         const ObjectXmlOptions& options) {
    xml += "<VALUE.NAMEDINSTANCE>";
    appendInstanceName(xml, instance.getPath());
    appendInstance(xml, instance, options);
    xml += "</VALUE.NAMEDINSTANCE>\n";
}

}  // namespace Pegasus
