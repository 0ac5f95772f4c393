#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/Exception.h>

#include <algorithm>

namespace Pegasus {

namespace {

String withoutLeadingSlash(const String& name) {
    return name[0] == '/' ? name.subString(1) : name;
}

}  // namespace

CIMNamespaceName::CIMNamespaceName(const String& name) : name(withoutLeadingSlash(name)) {
    if (!legal(name))
        throw InvalidNamespaceNameException(
            "\"" + name + "\" is not a namespace name: expected CIM names joined by \"/\"");
}

CIMNamespaceName::CIMNamespaceName(const char* name) : CIMNamespaceName(String(name)) {}

Boolean CIMNamespaceName::legal(const String& name) {
    const String joined = withoutLeadingSlash(name);
    for (Uint32 begin = 0;;) {
        const Uint32 end = std::min(joined.find(begin, '/'), joined.size());
        if (!CIMName::legal(joined.subString(begin, end - begin)))
            return false;
        if (end == joined.size())
            return true;
        begin = end + 1;
    }
}

void CIMNamespaceName::clear() {
    name.clear();
}

Boolean CIMNamespaceName::equal(const CIMNamespaceName& other) const {
    return String::equalNoCase(name, other.name);
}

}  // namespace Pegasus
