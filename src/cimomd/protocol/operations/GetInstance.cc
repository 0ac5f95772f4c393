#include "protocol/operations/GetInstance.h"

#include "protocol/InstanceAnswer.h"
#include "protocol/RequestChecks.h"

namespace cimomd {

std::unique_ptr<Answer> GetInstance::start(const Pegasus::CimRequest& request,
                                           const Model& model) const {
    request.requireOnly(
        {"InstanceName", "LocalOnly", "IncludeQualifiers", "IncludeClassOrigin", "PropertyList"});
    const Pegasus::CIMObjectPath path = request.instanceName("InstanceName");
    const Pegasus::CIMName& name = path.getClassName();
    if (name.isNull())
        failOperation(Pegasus::CIM_ERR_INVALID_PARAMETER,
                      "GetInstance needs the parameter InstanceName");
    Pegasus::ObjectXmlOptions options;
    static_cast<void>(request.flag("LocalOnly", true));
    static_cast<void>(request.flag("IncludeQualifiers", false));
    options.includeQualifiers = false;
    options.includeClassOrigin = request.flag("IncludeClassOrigin", false);
    options.propertyList = request.propertyList("PropertyList");
    InstanceKeys keys(requiredClass(model, request, name, Pegasus::CIM_ERR_INVALID_CLASS), path,
                      request.nameSpace);
    return std::make_unique<InstanceAnswer>(InstanceCursor(model, request.nameSpace, {name}),
                                            std::move(keys), options);
}

}  // namespace cimomd
