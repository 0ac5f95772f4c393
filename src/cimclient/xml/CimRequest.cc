#include "xml/CimRequest.h"

#include <Pegasus/Common/Exception.h>

#include "xml/ScalarParser.h"
#include "xml/XmlCharacters.h"

namespace Pegasus {

namespace {

[[noreturn]] void failParameter(std::string_view name, const std::string& message) {
    throw CIMException(CIM_ERR_INVALID_PARAMETER,
                       makeString("parameter " + quotedForMessage(name) + " " + message));
}

}  // namespace

const CimParameter* CimRequest::find(std::string_view name) const {
    const CimParameter* found = nullptr;
    for (const CimParameter& parameter : parameters) {
        if (equalsIgnoringCase(parameter.name, name)) {
            if (found != nullptr) {
                failParameter(name, "is given twice");
            }
            found = &parameter;
        }
    }
    return found;
}

// The value when there is one; nullptr when the parameter is absent or null.
template <typename T>
const T* CimRequest::valueOf(std::string_view name, const char* expected) const {
    const CimParameter* parameter = find(name);
    if (parameter == nullptr || std::holds_alternative<std::monostate>(parameter->value)) {
        return nullptr;
    }
    const T* value = std::get_if<T>(&parameter->value);
    if (value == nullptr) {
        failParameter(name, std::string("is of the wrong kind; expected ") + expected);
    }
    return value;
}

Boolean CimRequest::flag(std::string_view name, Boolean fallback) const {
    const String* value = valueOf<String>(name, "VALUE");
    if (value == nullptr) {
        return fallback;
    }
    const CString utf8 = value->getCString();
    const std::string_view word(utf8);
    Boolean result = fallback;
    if (!parseScalar(ElementText{word, word}, result)) {
        failParameter(name, "is " + quotedForMessage(word) + "; expected TRUE or FALSE");
    }
    return result;
}

CIMName CimRequest::className(std::string_view name) const {
    const CIMName* value = valueOf<CIMName>(name, "CLASSNAME");
    return value == nullptr ? CIMName() : *value;
}

CIMObjectPath CimRequest::instanceName(std::string_view name) const {
    const CIMObjectPath* value = valueOf<CIMObjectPath>(name, "INSTANCENAME");
    return value == nullptr ? CIMObjectPath() : *value;
}

CIMPropertyList CimRequest::propertyList(std::string_view name) const {
    const Array<String>* value = valueOf<Array<String>>(name, "VALUE.ARRAY");
    if (value == nullptr) {
        return CIMPropertyList();
    }
    Array<CIMName> names;
    for (const String& text : *value) {
        if (CIMName::legal(text)) {
            names.append(CIMName(text));
        }
    }
    return CIMPropertyList(names);
}

const String* CimRequest::text(std::string_view name) const {
    return valueOf<String>(name, "VALUE");
}

void CimRequest::requireOnly(std::initializer_list<std::string_view> known) const {
    for (const CimParameter& parameter : parameters) {
        bool isKnown = false;
        for (const std::string_view name : known) {
            isKnown = isKnown || equalsIgnoringCase(name, parameter.name);
        }
        if (!isKnown) {
            failParameter(parameter.name, "is not one of this operation");
        }
        find(parameter.name);
    }
}

}  // namespace Pegasus
