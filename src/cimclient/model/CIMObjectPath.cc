#include <Pegasus/Common/CIMObjectPath.h>

#include <algorithm>
#include <utility>
#include <vector>

#include "ObjectPathBody.h"
#include "ObjectPathParser.h"

namespace Pegasus {

namespace {

std::vector<CIMKeyBinding> sortedByName(const Array<CIMKeyBinding>& keys) {
    std::vector<CIMKeyBinding> sorted(keys.begin(), keys.end());
    std::stable_sort(
        sorted.begin(), sorted.end(), [](const CIMKeyBinding& a, const CIMKeyBinding& b) {
            return String::compareNoCase(a.getName().getString(), b.getName().getString()) < 0;
        });
    return sorted;
}

void appendQuoted(String& out, const String& value) {
    out.append('"');
    for (Uint32 i = 0; i < value.size(); ++i) {
        const Char16 character = value[i];
        if (character == '"' || character == '\\')
            out.append('\\');
        out.append(character);
    }
    out.append('"');
}

void appendKey(String& out, const CIMKeyBinding& key) {
    out.append(key.getName().getString()).append('=');
    if (key.getType() == CIMKeyBinding::STRING || key.getType() == CIMKeyBinding::REFERENCE)
        appendQuoted(out, key.getValue());
    else
        out.append(key.getValue());
}

}  // namespace

CIMObjectPath::CIMObjectPath() : body(new ObjectPathBody) {}

CIMObjectPath::CIMObjectPath(const String& host, CIMNamespaceName nameSpace, CIMName className,
                             Array<CIMKeyBinding> keyBindings)
    : CIMObjectPath() {
    setHost(host);
    body.get()->nameSpace = std::move(nameSpace);
    body.get()->className = std::move(className);
    body.get()->keyBindings = std::move(keyBindings);
}

CIMObjectPath::CIMObjectPath(const String& text) : CIMObjectPath() {
    ObjectPathParser(text).parse(*body.get());
}

CIMObjectPath::CIMObjectPath(const char* text) : CIMObjectPath(String(text)) {}

const String& CIMObjectPath::getHost() const {
    return body.get()->host;
}

void CIMObjectPath::setHost(const String& host) {
    requireHost(host);
    body.get()->host = host;
}

const CIMNamespaceName& CIMObjectPath::getNameSpace() const {
    return body.get()->nameSpace;
}

void CIMObjectPath::setNameSpace(const CIMNamespaceName& nameSpace) {
    body.get()->nameSpace = nameSpace;
}

const CIMName& CIMObjectPath::getClassName() const {
    return body.get()->className;
}

void CIMObjectPath::setClassName(const CIMName& className) {
    body.get()->className = className;
}

const Array<CIMKeyBinding>& CIMObjectPath::getKeyBindings() const {
    return body.get()->keyBindings;
}

void CIMObjectPath::setKeyBindings(const Array<CIMKeyBinding>& keyBindings) {
    body.get()->keyBindings = keyBindings;
}

String CIMObjectPath::toString() const {
    String out;
    if (getHost().size() != 0)
        out.append("//").append(getHost()).append('/');
    if (!getNameSpace().isNull())
        out.append(getNameSpace().getString()).append(':');
    out.append(getClassName().getString());
    Char16 separator('.');
    for (const CIMKeyBinding& key : sortedByName(getKeyBindings())) {
        out.append(separator);
        appendKey(out, key);
        separator = ',';
    }
    return out;
}

Boolean CIMObjectPath::identical(const CIMObjectPath& other) const {
    return String::equalNoCase(getHost(), other.getHost()) &&
           getNameSpace().equal(other.getNameSpace()) &&
           getClassName().equal(other.getClassName()) &&
           sortedByName(getKeyBindings()) == sortedByName(other.getKeyBindings());
}

CIMObjectPath CIMObjectPath::clone() const {
    CIMObjectPath copy;
    copy.body = BodyRef<ObjectPathBody>(new ObjectPathBody(*body.get()));
    return copy;
}

}  // namespace Pegasus
