#include "protocol/operations/EnumerateClasses.h"

#include "protocol/ClassSelection.h"
#include "protocol/ClassesAnswer.h"

namespace cimomd {

std::unique_ptr<Answer> EnumerateClasses::start(const Pegasus::CimRequest& request,
                                                const Model& model) const {
    request.requireOnly(
        {"ClassName", "DeepInheritance", "LocalOnly", "IncludeQualifiers", "IncludeClassOrigin"});
    Pegasus::ObjectXmlOptions options;
    options.localOnly = request.flag("LocalOnly", true);
    options.includeQualifiers = request.flag("IncludeQualifiers", true);
    options.includeClassOrigin = request.flag("IncludeClassOrigin", false);
    return std::make_unique<ClassesAnswer>(model, request.nameSpace, selectClasses(request, model),
                                           options);
}

}  // namespace cimomd
