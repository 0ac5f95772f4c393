#include "protocol/operations/EnumerateInstanceNames.h"

#include "protocol/InstanceNamesAnswer.h"
#include "protocol/RequestChecks.h"

namespace cimomd {

std::unique_ptr<Answer> EnumerateInstanceNames::start(const Pegasus::CimRequest& request,
                                                      const Model& model) const {
    request.requireOnly({"ClassName"});
    const Pegasus::CIMName name = requiredClassName(request);
    requiredClass(model, request, name, Pegasus::CIM_ERR_INVALID_CLASS);
    InstanceCursor cursor(model, request.nameSpace,
                          model.classes->withDescendants(request.nameSpace, name));
    return std::make_unique<InstanceNamesAnswer>(std::move(cursor));
}

}  // namespace cimomd
