#include "protocol/operations/EnumerateClassNames.h"

#include "protocol/ClassNamesAnswer.h"
#include "protocol/ClassSelection.h"

namespace cimomd {

std::unique_ptr<Answer> EnumerateClassNames::start(const Pegasus::CimRequest& request,
                                                   const Model& model) const {
    request.requireOnly({"ClassName", "DeepInheritance"});
    return std::make_unique<ClassNamesAnswer>(selectClasses(request, model));
}

}  // namespace cimomd
