#include "xml/CimXmlWriter.h"

#include "model/XmlText.h"

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
    if (className.isNull()) {
        return;
    }
    xml += "<IPARAMVALUE NAME=\"ClassName\">";
    appendClassName(xml, className);
    xml += "</IPARAMVALUE>";
}

void endCall(std::string& xml) {
    xml += "</IMETHODCALL></SIMPLEREQ>";
    endMessage(xml);
}

std::string_view responseElement(CallKind kind) {
    return kind == CallKind::Extrinsic ? "METHODRESPONSE" : "IMETHODRESPONSE";
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

std::string encodeEnumerateClassNamesRequest(std::string_view messageId,
                                             const CIMNamespaceName& nameSpace,
                                             const CIMName& className, Boolean deepInheritance) {
    std::string xml;
    beginCall(xml, messageId, "EnumerateClassNames", nameSpace, className);
    appendFlagParameter(xml, "DeepInheritance", deepInheritance);
    endCall(xml);
    return xml;
}

void beginResponse(std::string& xml, std::string_view messageId, std::string_view method,
                   CallKind kind) {
    beginMessage(xml, messageId);
    xml.append("<SIMPLERSP><").append(responseElement(kind));
    appendAttribute(xml, "NAME", method);
    xml += '>';
}

void endResponse(std::string& xml, CallKind kind) {
    xml.append("</").append(responseElement(kind)).append("></SIMPLERSP>");
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

void appendNamedInstance(std::string& xml, const CIMConstInstance& instance,
                         InstanceWriter& writer) {
    xml += "<VALUE.NAMEDINSTANCE>";
    appendInstanceName(xml, instance.getPath());
    writer.append(xml, instance);
    xml += "</VALUE.NAMEDINSTANCE>\n";
}

void appendNamedInstance(std::string& xml, const CIMConstInstance& instance) {
    InstanceWriter writer{ObjectXmlOptions()};
    appendNamedInstance(xml, instance, writer);
}

}  // namespace Pegasus
