// The elements of DSP0201 that name namespaces, classes and instances.

#include <Pegasus/Common/Array.h>
#include <Pegasus/Common/CIMKeyBinding.h>
#include <Pegasus/Common/Exception.h>

#include "ObjectXml.h"
#include "XmlText.h"

namespace Pegasus {

namespace {

void appendNamespacePath(std::string& xml, const CIMObjectPath& path) {
    xml += "<NAMESPACEPATH><HOST>";
    appendEscaped(xml, path.getHost());
    xml += "</HOST>";
    appendLocalNamespacePath(xml, path.getNameSpace());
    xml += "</NAMESPACEPATH>";
}

void appendKeyValue(std::string& xml, std::string_view type, const String& value) {
    xml += "<KEYVALUE";
    appendAttribute(xml, "VALUETYPE", type);
    xml += '>';
    appendEscaped(xml, value);
    xml += "</KEYVALUE>";
}

// The text of a reference key is a path; one that is none can only be sent as a string.
void appendReferenceKey(std::string& xml, const String& text) {
    try {
        appendReference(xml, CIMObjectPath(text));
    } catch (const MalformedObjectNameException&) {
        appendKeyValue(xml, "string", text);
    }
}

void appendKeyContent(std::string& xml, const CIMKeyBinding& key) {
    switch (key.getType()) {
        case CIMKeyBinding::BOOLEAN:
            appendKeyValue(xml, "boolean", key.getValue());
            break;
        case CIMKeyBinding::NUMERIC:
            appendKeyValue(xml, "numeric", key.getValue());
            break;
        case CIMKeyBinding::REFERENCE:
            appendReferenceKey(xml, key.getValue());
            break;
        case CIMKeyBinding::STRING:
            appendKeyValue(xml, "string", key.getValue());
            break;
    }
}

// The grammar lets a single key go without a name, and then without KEYBINDING.
void appendKey(std::string& xml, const CIMKeyBinding& key) {
    if (key.getName().isNull()) {
        appendKeyContent(xml, key);
        return;
    }
    xml += "<KEYBINDING";
    appendAttribute(xml, "NAME", key.getName().getString());
    xml += '>';
    appendKeyContent(xml, key);
    xml += "</KEYBINDING>";
}

void appendObjectName(std::string& xml, const CIMObjectPath& path) {
    if (path.getKeyBindings().size() == 0) {
        appendClassName(xml, path.getClassName());
    } else {
        appendInstanceName(xml, path);
    }
}

}  // namespace

void appendLocalNamespacePath(std::string& xml, const CIMNamespaceName& nameSpace) {
    xml += "<LOCALNAMESPACEPATH>";
    const String& names = nameSpace.getString();
    Uint32 begin = 0;
    while (begin < names.size()) {
        Uint32 end = names.find(begin, '/');
        if (end == PEG_NOT_FOUND) {
            end = names.size();
        }
        xml += "<NAMESPACE";
        appendAttribute(xml, "NAME", names.subString(begin, end - begin));
        xml += "/>";
        begin = end + 1;
    }
    xml += "</LOCALNAMESPACEPATH>";
}

void appendClassName(std::string& xml, const CIMName& className) {
    xml += "<CLASSNAME";
    appendAttribute(xml, "NAME", className.getString());
    xml += "/>";
}

void appendInstanceName(std::string& xml, const CIMObjectPath& path) {
    xml += "<INSTANCENAME";
    appendAttribute(xml, "CLASSNAME", path.getClassName().getString());
    xml += '>';
    for (const CIMKeyBinding& key : path.getKeyBindings()) {
        appendKey(xml, key);
    }
    xml += "</INSTANCENAME>";
}

void appendReference(std::string& xml, const CIMObjectPath& path) {
    const bool isInstance = path.getKeyBindings().size() != 0;
    const bool hasNamespace = !path.getNameSpace().isNull();
    const bool hasHost = hasNamespace && path.getHost().size() != 0;
    xml += "<VALUE.REFERENCE>";
    if (hasHost) {
        xml += isInstance ? "<INSTANCEPATH>" : "<CLASSPATH>";
        appendNamespacePath(xml, path);
        appendObjectName(xml, path);
        xml += isInstance ? "</INSTANCEPATH>" : "</CLASSPATH>";
    } else if (hasNamespace) {
        xml += isInstance ? "<LOCALINSTANCEPATH>" : "<LOCALCLASSPATH>";
        appendLocalNamespacePath(xml, path.getNameSpace());
        appendObjectName(xml, path);
        xml += isInstance ? "</LOCALINSTANCEPATH>" : "</LOCALCLASSPATH>";
    } else {
        appendObjectName(xml, path);
    }
    xml += "</VALUE.REFERENCE>";
}

}  // namespace Pegasus
