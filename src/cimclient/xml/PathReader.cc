#include "xml/PathReader.h"

#include <Pegasus/Common/Array.h>
#include <Pegasus/Common/Exception.h>

#include <algorithm>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "xml/ScalarParser.h"
#include "xml/XmlCharacters.h"

namespace Pegasus {

namespace {

// A reference becomes text when it is a key, with all quotation marks and backslashes doubled, and
// that again in the next one around it: a small document could make gigabytes of them.
constexpr unsigned kMostReferences = 4;
constexpr Uint32 kMostReferenceCharacters = 65536;

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

bool fewHaveDuplicates(const Array<CIMKeyBinding>& keys) {
    for (Uint32 i = 1; i < keys.size(); ++i) {
        for (Uint32 k = 0; k < i; ++k) {
            if (keys[i].getName().equal(keys[k].getName())) {
                return true;
            }
        }
    }
    return false;
}

// Sorts many, so that an absurd number of keys takes no absurd time.
bool hasDuplicates(const Array<CIMKeyBinding>& keys) {
    constexpr Uint32 kFew = 8;
    if (keys.size() <= kFew) {
        return fewHaveDuplicates(keys);
    }
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
    while (readKnownKey(keys) || readNextKey(keys)) {
    }
    if (hasDuplicates(keys)) {
        reader.fail("a key of an instance name is given twice");
    }
    return CIMObjectPath(String(), CIMNamespaceName(), className, std::move(keys));
}

// Adds a key that looks like that of an earlier instance but for its value.
bool PathReader::readKnownKey(Array<CIMKeyBinding>& keys) {
    if (known == nullptr || keys.size() >= known->size()) {
        return false;
    }
    KnownKey& key = (*known)[keys.size()];
    if (!reader.readLike(key.markup)) {
        return false;
    }
    const ElementText text = reader.takeText();
    if (key.latestText != text.raw) {
        key.latestValue = makeKey(key.name, key.type, text).getValue();
        key.latestText = text.raw;
    }
    keys.append(CIMKeyBinding(key.name, key.latestValue, key.type));
    return true;
}

// Adds the next key; false when there is none.
bool PathReader::readNextKey(Array<CIMKeyBinding>& keys) {
    const std::uint64_t begin = reader.position();
    if (!reader.nextChild()) {
        return false;
    }
    const bool isBinding = reader.is("KEYBINDING");
    const CIMKeyBinding key = isBinding ? readKeyBinding() : readKey(CIMName());
    if (known != nullptr && isBinding && key.getType() != CIMKeyBinding::REFERENCE) {
        learn(key, keys.size(), reader.readSince(begin));
    }
    keys.append(key);
    return true;
}

void PathReader::learn(const CIMKeyBinding& key, Uint32 position, std::string_view element) {
    constexpr Uint32 kMostKeys = 64;
    std::optional<MarkupRun> markup = MarkupRun::ofOneText(element, "KEYVALUE");
    if (!markup || position > known->size() || position == kMostKeys) {
        return;
    }
    KnownKey seen{key.getName(), key.getType(), std::move(*markup), {}, {}};
    if (position == known->size()) {
        known->push_back(std::move(seen));
    } else {
        (*known)[position] = std::move(seen);
    }
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
        return CIMKeyBinding(name, readReferenceKey(), CIMKeyBinding::REFERENCE);
    }
    reader.failUnexpected("KEYBINDING, KEYVALUE or VALUE.REFERENCE");
}

String PathReader::readReferenceKey() {
    if (references == kMostReferences) {
        reader.fail("there are too many references inside each other");
    }
    ++references;
    String text = readReference().toString();
    --references;
    if (text.size() > kMostReferenceCharacters) {
        reader.fail("a key's reference is too long");
    }
    return text;
}

CIMKeyBinding PathReader::readKeyValue(const CIMName& name) {
    const CIMKeyBinding::Type type = keyType(reader);
    return makeKey(name, type, reader.readText());
}

CIMKeyBinding PathReader::makeKey(const CIMName& name, CIMKeyBinding::Type type,
                                  const ElementText& text) const {
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
