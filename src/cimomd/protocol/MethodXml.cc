#include "protocol/MethodXml.h"

#include <string_view>

#include "model/XmlText.h"

namespace cimomd {
namespace {

using Pegasus::appendAttribute;

void appendQualifiers(std::string& xml, const std::vector<Pegasus::CIMConstQualifier>& qualifiers,
                      const Pegasus::ObjectXmlOptions& options) {
    if (!options.includeQualifiers)
        return;
    for (const Pegasus::CIMConstQualifier& qualifier : qualifiers) {
        if (!options.localOnly || !qualifier.getPropagated())
            Pegasus::appendQualifier(xml, qualifier);
    }
}

std::string_view elementOf(const ParameterDeclaration& parameter) {
    if (parameter.type == Pegasus::CIMTYPE_REFERENCE)
        return parameter.isArray ? "PARAMETER.REFARRAY" : "PARAMETER.REFERENCE";
    return parameter.isArray ? "PARAMETER.ARRAY" : "PARAMETER";
}

void appendParameter(std::string& xml, const ParameterDeclaration& parameter,
                     const Pegasus::ObjectXmlOptions& options) {
    const std::string_view element = elementOf(parameter);
    xml.append("<").append(element);
    appendAttribute(xml, "NAME", parameter.name.getString());
    if (parameter.type != Pegasus::CIMTYPE_REFERENCE)
        appendAttribute(xml, "TYPE", std::string_view(Pegasus::cimTypeToString(parameter.type)));
    if (!parameter.referenceClass.isNull())
        appendAttribute(xml, "REFERENCECLASS", parameter.referenceClass.getString());
    if (parameter.arraySize != 0)
        appendAttribute(xml, "ARRAYSIZE", std::string_view(std::to_string(parameter.arraySize)));
    xml += '>';
    appendQualifiers(xml, parameter.qualifiers, options);
    xml.append("</").append(element).append(">");
}

void appendMethod(std::string& xml, const MethodDeclaration& method,
                  const Pegasus::ObjectXmlOptions& options) {
    xml += "<METHOD";
    appendAttribute(xml, "NAME", method.name.getString());
    appendAttribute(xml, "TYPE", std::string_view(Pegasus::cimTypeToString(method.returnType)));
    if (options.includeClassOrigin && !method.classOrigin.isNull())
        appendAttribute(xml, "CLASSORIGIN", method.classOrigin.getString());
    if (method.isPropagated)
        appendAttribute(xml, "PROPAGATED", std::string_view("true"));
    xml += '>';
    appendQualifiers(xml, method.qualifiers, options);
    for (const ParameterDeclaration& parameter : method.parameters)
        appendParameter(xml, parameter, options);
    xml += "</METHOD>";
}

}  // namespace

void appendMethods(std::string& xml, const MethodList& methods,
                   const Pegasus::ObjectXmlOptions& options) {
    for (const auto& method : methods) {
        if (!options.localOnly || !method->isPropagated)
            appendMethod(xml, *method, options);
    }
}

}  // namespace cimomd
