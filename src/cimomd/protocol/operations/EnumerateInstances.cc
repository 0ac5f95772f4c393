#include "protocol/operations/EnumerateInstances.h"

#include "protocol/InstancesAnswer.h"
#include "protocol/RequestChecks.h"

namespace cimomd {
namespace {

using Pegasus::CIMConstClass;
using Pegasus::CIMName;
using Pegasus::CIMPropertyList;
using Pegasus::Uint32;

bool isWanted(const CIMPropertyList& list, const CIMName& name) {
    if (list.isNull())
        return true;
    for (Uint32 i = 0; i < list.size(); ++i) {
        if (list[i].equal(name))
            return true;
    }
    return false;
}

/// The properties of `cimClass` that `list` names. What subclasses add is not among them.
CIMPropertyList restrictedTo(const CIMConstClass& cimClass, const CIMPropertyList& list) {
    Pegasus::Array<CIMName> names;
    for (Uint32 i = 0; i < cimClass.getPropertyCount(); ++i) {
        const CIMName& name = cimClass.getProperty(i).getName();
        if (isWanted(list, name))
            names.append(name);
    }
    return CIMPropertyList(names);
}

}  // namespace

std::unique_ptr<Answer> EnumerateInstances::start(const Pegasus::CimRequest& request,
                                                  const Model& model) const {
    request.requireOnly({"ClassName", "LocalOnly", "DeepInheritance", "IncludeQualifiers",
                         "IncludeClassOrigin", "PropertyList"});
    const CIMName name = requiredClassName(request);
    Pegasus::ObjectXmlOptions options;
    static_cast<void>(request.flag("LocalOnly", true));
    static_cast<void>(request.flag("IncludeQualifiers", false));
    options.includeQualifiers = false;
    options.includeClassOrigin = request.flag("IncludeClassOrigin", false);
    options.propertyList = request.propertyList("PropertyList");
    const bool deep = request.flag("DeepInheritance", true);
    const CIMConstClass& cimClass =
        requiredClass(model, request, name, Pegasus::CIM_ERR_INVALID_CLASS);
    if (!deep)
        options.propertyList = restrictedTo(cimClass, options.propertyList);
    InstanceCursor cursor(model, request.nameSpace,
                          model.classes->withDescendants(request.nameSpace, name));
    return std::make_unique<InstancesAnswer>(std::move(cursor), options);
}

}  // namespace cimomd
