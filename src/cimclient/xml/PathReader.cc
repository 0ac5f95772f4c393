#include "xml/PathReader.h"

#include <Pegasus/Common/Array.h>
#include <Pegasus/Common/Exception.h>

#include <algorithm>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "xml/ScalarParser.h"
#include "xml/XmlCharacters.h"

namespace Pegasus {

namespace {

CIMKeyBinding::Type keyType(const ElementReader& reader) {
    const std::string_view type = reader.attribute("VALUETYPE").value_or("string");
    if (type == "string") {
        return CIMKeyBinding::STRING;
    }
    if (type == "boolean") {
        return CIMKeyBinding::BOOLEAN;
    }
    if (type == "numeric") {
        return CIMKeyBinding::NUMERIC;
    }
    reader.fail("attribute VALUETYPE is " + quotedForMessage(type) +
                "; expected string, boolean or numeric");
}

bool isNumber(const ElementText& text) {
    Sint64 negative = 0;
    Uint64 positive = 0;
    Real64 real = 0;
    return parseScalar(text, positive) || parseScalar(text, negative) || parseScalar(text, real);
}

// Sorts, so that an absurd number of keys takes no absurd time.
bool hasDuplicates(const Array<CIMKeyBinding>& keys) {
    std::vector<const CIMName*> names;
    names.reserve(keys.size());
    for (const CIMKeyBinding& key : keys) {
        names.push_back(&key.getName());
    }
    std::sort(names.begin(), names.end(), [](const CIMName* a, const CIMName* b) {
        return String::compareNoCase(a->getString(), b->getString()) < 0;
    });
    const auto areEqual = [](const CIMName* a, const CIMName* b) { return a->equal(*b); };
    return std::adjacent_find(names.begin(), names.end(), areEqual) != names.end();
}

}  // namespace

CIMNamespaceName PathReader::readLocalNamespacePath() {
    std::string joined;
    while (reader.nextChild()) {
        if (!reader.is("NAMESPACE")) {
            reader.failUnexpected("NAMESPACE");
        }
        if (!joined.empty()) {
            joined += '/';
        }
        joined += reader.requiredAttribute("NAME");
        reader.readEnd();
    }
    try {
        return CIMNamespaceName(makeString(joined));
    } catch (const InvalidNamespaceNameException&) {
        reader.fail("namespace " + quotedForMessage(joined) + " has no legal name");
    }
}

CIMName PathReader::readClassName() {
    CIMName name = context.requiredName(reader, "NAME");
    reader.readEnd();
    return name;
}

CIMObjectPath PathReader::readInstanceName() {
    const CIMName className = context.requiredName(reader, "CLASSNAME");
    Array<CIMKeyBinding> keys;
    while (reader.nextChild()) {
        keys.append(reader.is("KEYBINDING") ? readKeyBinding() : readKey(CIMName()));
    }
    if (hasDuplicates(keys)) {
        reader.fail("a key of an instance name is given twice");
    }
    return CIMObjectPath(String(), CIMNamespaceName(), className, std::move(keys));
}

CIMKeyBinding PathReader::readKeyBinding() {
    const CIMName name = context.requiredName(reader, "NAME");
    reader.requireChild("KEYVALUE or VALUE.REFERENCE");
    CIMKeyBinding key = readKey(name);
    reader.readEnd();
    return key;
}

CIMKeyBinding PathReader::readKey(const CIMName& name) {
    if (reader.is("KEYVALUE")) {
        return readKeyValue(name);
    }
    if (reader.is("VALUE.REFERENCE")) {
        return CIMKeyBinding(name, readReference().toString(), CIMKeyBinding::REFERENCE);
    }
    reader.failUnexpected("KEYBINDING, KEYVALUE or VALUE.REFERENCE");
}

CIMKeyBinding PathReader::readKeyValue(const CIMName& name) {
    const CIMKeyBinding::Type type = keyType(reader);
    const ElementText text = reader.readText();
    Boolean isTrue = false;
    if (type == CIMKeyBinding::BOOLEAN) {
        if (!parseScalar(text, isTrue)) {
            reader.fail("key value " + quotedForMessage(text.raw) + " is no boolean");
        }
        return CIMKeyBinding(name, isTrue ? "TRUE" : "FALSE", type);
    }
    if (type == CIMKeyBinding::NUMERIC) {
        if (!isNumber(text)) {
            reader.fail("key value " + quotedForMessage(text.raw) + " is no number");
        }
        return CIMKeyBinding(name, makeString(trimXmlSpace(text.raw)), type);
    }
    return CIMKeyBinding(name, makeString(text.trimmed), type);
}

CIMObjectPath PathReader::readReference() {
    reader.requireChild("a path");
    CIMObjectPath path = readAnyPath();
    reader.readEnd();
    return path;
}

CIMObjectPath PathReader::readAnyPath() {
    if (reader.is("INSTANCENAME")) {
        return readInstanceName();
    }
    if (reader.is("LOCALINSTANCEPATH")) {
        return readLocalInstancePath();
    }
    if (reader.is("INSTANCEPATH")) {
        return readInstancePath();
    }
    if (reader.is("CLASSNAME")) {
        return CIMObjectPath(String(), CIMNamespaceName(), readClassName());
    }
    if (reader.is("LOCALCLASSPATH")) {
        return readLocalClassPath();
    }
    if (reader.is("CLASSPATH")) {
        return readClassPath();
    }
    reader.failUnexpected("a class name, an instance name or a path");
}

CIMObjectPath PathReader::readLocalInstancePath() {
    reader.requireChildNamed("LOCALNAMESPACEPATH");
    const CIMNamespaceName nameSpace = readLocalNamespacePath();
    reader.requireChildNamed("INSTANCENAME");
    CIMObjectPath path = readInstanceName();
    path.setNameSpace(nameSpace);
    reader.readEnd();
    return path;
}

CIMObjectPath PathReader::readInstancePath() {
    CIMObjectPath place;
    reader.requireChildNamed("NAMESPACEPATH");
    readNamespacePath(place);
    reader.requireChildNamed("INSTANCENAME");
    CIMObjectPath path = readInstanceName();
    path.setHost(place.getHost());
    path.setNameSpace(place.getNameSpace());
    reader.readEnd();
    return path;
}

CIMObjectPath PathReader::readLocalClassPath() {
    reader.requireChildNamed("LOCALNAMESPACEPATH");
    const CIMNamespaceName nameSpace = readLocalNamespacePath();
    reader.requireChildNamed("CLASSNAME");
    CIMObjectPath path(String(), nameSpace, readClassName());
    reader.readEnd();
    return path;
}

CIMObjectPath PathReader::readClassPath() {
    CIMObjectPath path;
    reader.requireChildNamed("NAMESPACEPATH");
    readNamespacePath(path);
    reader.requireChildNamed("CLASSNAME");
    path.setClassName(readClassName());
    reader.readEnd();
    return path;
}

void PathReader::readNamespacePath(CIMObjectPath& path) {
    reader.requireChildNamed("HOST");
    readHost(path);
    reader.requireChildNamed("LOCALNAMESPACEPATH");
    path.setNameSpace(readLocalNamespacePath());
    reader.readEnd();
}

void PathReader::readHost(CIMObjectPath& path) {
    const std::string_view host = reader.readText().trimmed;
    try {
        path.setHost(makeString(host));
    } catch (const MalformedObjectNameException&) {
        reader.fail("host " + quotedForMessage(host) + " has no legal name");
    }
}

}  // namespace Pegasus
