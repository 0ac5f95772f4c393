#include "protocol/operations/GetClass.h"

#include "protocol/ClassesAnswer.h"
#include "protocol/RequestChecks.h"

namespace cimomd {

std::unique_ptr<Answer> GetClass::start(const Pegasus::CimRequest& request,
                                        const Model& model) const {
    request.requireOnly(
        {"ClassName", "LocalOnly", "IncludeQualifiers", "IncludeClassOrigin", "PropertyList"});
    const Pegasus::CIMName name = requiredClassName(request);
    Pegasus::ObjectXmlOptions options;
    options.localOnly = request.flag("LocalOnly", true);
    options.includeQualifiers = request.flag("IncludeQualifiers", true);
    options.includeClassOrigin = request.flag("IncludeClassOrigin", false);
    options.propertyList = request.propertyList("PropertyList");
    requiredClass(model, request, name, Pegasus::CIM_ERR_NOT_FOUND);
    return std::make_unique<ClassesAnswer>(model, request.nameSpace,
                                           std::vector<Pegasus::CIMName>{name}, options);
}

}  // namespace cimomd
