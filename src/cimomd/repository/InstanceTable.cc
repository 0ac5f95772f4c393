#include "repository/InstanceTable.h"

#include <Pegasus/Common/Exception.h>

#include "text/CimText.h"
#include "text/Utf8.h"

namespace cimomd {
namespace {

using Pegasus::Array;
using Pegasus::CIMKeyBinding;
using Pegasus::CIMNamespaceName;
using Pegasus::CIMObjectPath;
using Pegasus::String;
using Pegasus::Uint32;

/// References may be written with or without their namespace and with their keys in any order.
String referenceText(const String& text, const CIMNamespaceName& nameSpace) {
    try {
        CIMObjectPath path(text);
        path.setHost(String());
        if (path.getNameSpace().isNull())
            path.setNameSpace(nameSpace);
        return path.toString();
    } catch (const Pegasus::Exception&) {
        return text;
    }
}

/// One text for all ways to write the same keys.
std::string textOf(const CIMNamespaceName& nameSpace, const Array<CIMKeyBinding>& keys) {
    static const Pegasus::CIMName kAnyClass("_");
    Array<CIMKeyBinding> normal;
    for (Uint32 i = 0; i < keys.size(); ++i) {
        CIMKeyBinding key = keys[i];
        if (key.getType() == CIMKeyBinding::REFERENCE)
            key.setValue(referenceText(key.getValue(), nameSpace));
        key.setName(Pegasus::CIMName(cimString(lowerCase(utf8Of(key.getName().getString())))));
        normal.append(key);
    }
    return utf8Of(CIMObjectPath(String(), CIMNamespaceName(), kAnyClass, normal).toString());
}

}  // namespace

bool InstanceTable::add(const Pegasus::CIMInstance& instance) {
    const CIMObjectPath& path = instance.getPath();
    const auto [place, added] =
        indexByKeys.emplace(textOf(path.getNameSpace(), path.getKeyBindings()), instances.size());
    if (added)
        instances.push_back(packer.packed(instance));
    return added;
}

const Pegasus::CIMConstInstance* InstanceTable::find(const CIMNamespaceName& nameSpace,
                                                     const Array<CIMKeyBinding>& keys) const {
    const auto place = indexByKeys.find(textOf(nameSpace, keys));
    return place == indexByKeys.end() ? nullptr : &instances[place->second];
}

}  // namespace cimomd
