#include "mof/MofContext.h"

#include "text/CimText.h"
#include "text/Utf8.h"

namespace cimomd {

Pegasus::CIMName nameOf(const MofName& name) {
    return name.text.empty() ? Pegasus::CIMName() : Pegasus::CIMName(cimString(name.text));
}

std::string keyOf(const Pegasus::CIMNamespaceName& nameSpace, const Pegasus::CIMName& name) {
    return lowerCase(utf8Of(nameSpace.getString()) + ":" + utf8Of(name.getString()));
}

}  // namespace cimomd
