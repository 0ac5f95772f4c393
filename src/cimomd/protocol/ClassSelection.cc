#include "protocol/ClassSelection.h"

#include "protocol/RequestChecks.h"

namespace cimomd {

using Pegasus::CIMName;

std::vector<CIMName> selectClasses(const Pegasus::CimRequest& request, const Model& model) {
    const CIMName name = request.className("ClassName");
    const bool deep = request.flag("DeepInheritance", false);
    if (!name.isNull())
        requiredClass(model, request, name, Pegasus::CIM_ERR_INVALID_CLASS);
    std::vector<CIMName> children = name.isNull()
                                        ? model.classes->topClasses(request.nameSpace)
                                        : model.classes->subclassesOf(request.nameSpace, name);
    if (!deep)
        return children;
    std::vector<CIMName> all;
    for (const CIMName& child : children) {
        const auto family = model.classes->withDescendants(request.nameSpace, child);
        all.insert(all.end(), family.begin(), family.end());
    }
    return all;
}

}  // namespace cimomd
