#include "EmbeddedXml.h"

#include <Pegasus/Common/Exception.h>

#include <string>
#include <variant>

#include "ValueText.h"

namespace Pegasus {

namespace {

constexpr Uint16 kReplacement = 0xFFFD;

Boolean isEmbedded(CIMType type) {
    return type == CIMTYPE_OBJECT || type == CIMTYPE_INSTANCE;
}

const char* typeAttribute(CIMType type) {
    return cimTypeToString(isEmbedded(type) ? CIMTYPE_STRING : type);
}

const char* propertyElement(const CIMConstProperty& property) {
    if (property.getType() == CIMTYPE_REFERENCE)
        return property.isArray() ? "PROPERTY.REFARRAY" : "PROPERTY.REFERENCE";
    return property.isArray() ? "PROPERTY.ARRAY" : "PROPERTY";
}

/// The path in a key of type reference, or one without a class name when the text is no path.
CIMObjectPath referenceIn(const CIMKeyBinding& key) {
    try {
        return CIMObjectPath(key.getValue());
    } catch (const MalformedObjectNameException&) {
        return CIMObjectPath();
    }
}

const char* valueTypeOf(const CIMKeyBinding& key) {
    switch (key.getType()) {
        case CIMKeyBinding::BOOLEAN:
            return "boolean";
        case CIMKeyBinding::NUMERIC:
            return "numeric";
        case CIMKeyBinding::STRING:
        case CIMKeyBinding::REFERENCE:
            break;
    }
    return "string";
}

/// What stands for a character in XML, or null for one that stands for itself.
const char* escapeOf(Uint16 code) {
    switch (code) {
        case '&':
            return "&amp;";
        case '<':
            return "&lt;";
        case '>':
            return "&gt;";
        case '"':
            return "&quot;";
        case '\'':
            return "&apos;";
        case '\t':
            return "&#9;";
        case '\n':
            return "&#10;";
        case '\r':
            return "&#13;";
        default:
            return nullptr;
    }
}

}  // namespace

/// Writes VALUE, VALUE.ARRAY, VALUE.REFERENCE or VALUE.REFARRAY; nothing for null.
class EmbeddedXml::ValueElements {
  public:
    explicit ValueElements(EmbeddedXml& xml) : xml(xml) {}

    void operator()(std::monostate) const {}

    template <class T>
    void operator()(const T& scalar) const {
        String text;
        appendValueText(text, scalar);
        appendText(text);
    }

    void operator()(const Char16& scalar) const { appendText(String(&scalar, 1)); }

    void operator()(const CIMObjectPath& scalar) const { xml.appendReference(scalar); }

    template <class T>
    void operator()(const Array<T>& elements) const {
        appendAll(elements, "VALUE.ARRAY");
    }

    void operator()(const Array<CIMObjectPath>& elements) const {
        appendAll(elements, "VALUE.REFARRAY");
    }

  private:
    void appendText(const String& text) const {
        xml.out.append("<VALUE>");
        xml.appendEscaped(text);
        xml.endElement("VALUE");
    }

    template <class T>
    void appendAll(const Array<T>& elements, const char* element) const {
        xml.beginElement(element);
        xml.out.append('>');
        for (const T& scalar : elements)
            (*this)(scalar);
        xml.endElement(element);
    }

    EmbeddedXml& xml;
};

void EmbeddedXml::append(const CIMObject& object) {
    if (object.isClass())
        append(CIMClass(object));
    else
        append(CIMInstance(object));
}

void EmbeddedXml::append(const CIMClass& cimClass) {
    beginElement("CLASS");
    appendAttribute("NAME", cimClass.getClassName().getString());
    if (!cimClass.getSuperClassName().isNull())
        appendAttribute("SUPERCLASS", cimClass.getSuperClassName().getString());
    out.append('>');
    appendQualifiers(cimClass);
    appendProperties(cimClass);
    endElement("CLASS");
}

void EmbeddedXml::append(const CIMInstance& instance) {
    beginElement("INSTANCE");
    appendAttribute("CLASSNAME", instance.getClassName().getString());
    out.append('>');
    appendQualifiers(instance);
    appendProperties(instance);
    endElement("INSTANCE");
}

template <class Owner>
void EmbeddedXml::appendQualifiers(const Owner& owner) {
    for (Uint32 i = 0; i < owner.getQualifierCount(); ++i)
        appendQualifier(owner.getQualifier(i));
}

template <class Owner>
void EmbeddedXml::appendProperties(const Owner& owner) {
    for (Uint32 i = 0; i < owner.getPropertyCount(); ++i)
        appendProperty(owner.getProperty(i));
}

void EmbeddedXml::appendQualifier(const CIMConstQualifier& qualifier) {
    const CIMFlavor& flavor = qualifier.getFlavor();
    beginElement("QUALIFIER");
    appendAttribute("NAME", qualifier.getName().getString());
    appendAttribute("TYPE", typeAttribute(qualifier.getType()));
    // The rest is written only where it differs from what a reader assumes.
    if (qualifier.getPropagated())
        appendAttribute("PROPAGATED", "true");
    if (!flavor.has(CIMFlavor::OVERRIDABLE))
        appendAttribute("OVERRIDABLE", "false");
    if (!flavor.has(CIMFlavor::TOSUBCLASS))
        appendAttribute("TOSUBCLASS", "false");
    if (flavor.has(CIMFlavor::TOINSTANCE))
        appendAttribute("TOINSTANCE", "true");
    if (flavor.has(CIMFlavor::TRANSLATABLE))
        appendAttribute("TRANSLATABLE", "true");
    out.append('>');
    qualifier.getValue().visit(ValueElements(*this));
    endElement("QUALIFIER");
}

void EmbeddedXml::appendProperty(const CIMConstProperty& property) {
    const char* const element = propertyElement(property);
    beginElement(element);
    appendPropertyAttributes(property);
    out.append('>');
    appendQualifiers(property);
    property.getValue().visit(ValueElements(*this));
    endElement(element);
}

void EmbeddedXml::appendPropertyAttributes(const CIMConstProperty& property) {
    const CIMType type = property.getType();
    appendAttribute("NAME", property.getName().getString());
    if (type != CIMTYPE_REFERENCE)
        appendAttribute("TYPE", typeAttribute(type));
    if (!property.getReferenceClassName().isNull())
        appendAttribute("REFERENCECLASS", property.getReferenceClassName().getString());
    if (property.getArraySize() != 0)
        appendAttribute("ARRAYSIZE", std::to_string(property.getArraySize()).c_str());
    if (!property.getClassOrigin().isNull())
        appendAttribute("CLASSORIGIN", property.getClassOrigin().getString());
    if (property.getPropagated())
        appendAttribute("PROPAGATED", "true");
    if (isEmbedded(type))
        appendAttribute("EmbeddedObject", cimTypeToString(type));
}

void EmbeddedXml::appendReference(const CIMObjectPath& path) {
    const Boolean isInstance = path.getKeyBindings().size() != 0;
    const Boolean hasNamespace = !path.getNameSpace().isNull();
    const Boolean hasHost = hasNamespace && path.getHost().size() != 0;
    const char* element = nullptr;
    if (hasHost)
        element = isInstance ? "INSTANCEPATH" : "CLASSPATH";
    else if (hasNamespace)
        element = isInstance ? "LOCALINSTANCEPATH" : "LOCALCLASSPATH";

    out.append("<VALUE.REFERENCE>");
    if (element) {
        beginElement(element);
        out.append('>');
        appendNamespacePath(path);
    }
    appendObjectName(path);
    if (element)
        endElement(element);
    endElement("VALUE.REFERENCE");
}

void EmbeddedXml::appendNamespacePath(const CIMObjectPath& path) {
    const Boolean hasHost = path.getHost().size() != 0;
    if (hasHost) {
        out.append("<NAMESPACEPATH><HOST>");
        appendEscaped(path.getHost());
        endElement("HOST");
    }
    out.append("<LOCALNAMESPACEPATH>");
    const String& nameSpace = path.getNameSpace().getString();
    for (Uint32 begin = 0, end = 0; begin < nameSpace.size(); begin = end + 1) {
        end = nameSpace.find(begin, '/');
        if (end == PEG_NOT_FOUND)
            end = nameSpace.size();
        beginElement("NAMESPACE");
        appendAttribute("NAME", nameSpace.subString(begin, end - begin));
        out.append("/>");
    }
    endElement("LOCALNAMESPACEPATH");
    if (hasHost)
        endElement("NAMESPACEPATH");
}

void EmbeddedXml::appendObjectName(const CIMObjectPath& path) {
    const Array<CIMKeyBinding>& keys = path.getKeyBindings();
    if (keys.size() == 0) {
        beginElement("CLASSNAME");
        appendAttribute("NAME", path.getClassName().getString());
        out.append("/>");
        return;
    }
    beginElement("INSTANCENAME");
    appendAttribute("CLASSNAME", path.getClassName().getString());
    out.append('>');
    for (const CIMKeyBinding& key : keys)
        appendKey(key);
    endElement("INSTANCENAME");
}

void EmbeddedXml::appendKey(const CIMKeyBinding& key) {
    beginElement("KEYBINDING");
    appendAttribute("NAME", key.getName().getString());
    out.append('>');
    CIMObjectPath reference;
    if (key.getType() == CIMKeyBinding::REFERENCE)
        reference = referenceIn(key);
    if (reference.getClassName().isNull()) {
        beginElement("KEYVALUE");
        appendAttribute("VALUETYPE", valueTypeOf(key));
        out.append('>');
        appendEscaped(key.getValue());
        endElement("KEYVALUE");
    } else {
        appendReference(reference);
    }
    endElement("KEYBINDING");
}

void EmbeddedXml::appendAttribute(const char* name, const String& value) {
    out.append(' ').append(name).append("=\"");
    appendEscaped(value);
    out.append('"');
}

void EmbeddedXml::appendEscaped(const String& text) {
    for (Uint32 i = 0; i < text.size(); ++i) {
        const Uint16 code = text[i];
        if (const char* escape = escapeOf(code))
            out.append(escape);
        else
            // XML 1.0 has no form for the other control characters and for the last two codes.
            out.append(code < ' ' || code >= 0xFFFE ? kReplacement : code);
    }
}

}  // namespace Pegasus
