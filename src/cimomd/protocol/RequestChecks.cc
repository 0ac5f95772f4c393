#include "protocol/RequestChecks.h"

#include <Pegasus/Common/Exception.h>
#include <fmt/format.h>

#include "text/CimText.h"
#include "utf8/Utf8.h"

namespace cimomd {

void failOperation(Pegasus::CIMStatusCode code, const std::string& description) {
    throw Pegasus::CIMException(code, cimString(utf8::clean(description)));
}

Pegasus::CIMName requiredClassName(const Pegasus::CimRequest& request) {
    Pegasus::CIMName name = request.className("ClassName");
    if (name.isNull())
        failOperation(Pegasus::CIM_ERR_INVALID_PARAMETER,
                      fmt::format("{} needs the parameter ClassName", request.method));
    return name;
}

const Pegasus::CIMConstClass& requiredClass(const Model& model, const Pegasus::CimRequest& request,
                                            const Pegasus::CIMName& name,
                                            Pegasus::CIMStatusCode ifUnknown) {
    const Pegasus::CIMConstClass* found = model.classes->findClass(request.nameSpace, name);
    if (found == nullptr)
        failOperation(ifUnknown, fmt::format("there is no class {} in {}", utf8Of(name.getString()),
                                             utf8Of(request.nameSpace.getString())));
    return *found;
}

}  // namespace cimomd
