#include "providers/BuiltShapes.h"

#include <stdexcept>
#include <string>

namespace cimomd {
namespace {

std::shared_ptr<const Pegasus::InstanceShape> shapeOf(
    const std::vector<BuiltProperty>& properties) {
    std::vector<Pegasus::PropertyDeclaration> declarations;
    for (const BuiltProperty& property : properties) {
        Pegasus::PropertyDeclaration declaration;
        declaration.name = Pegasus::CIMName(property.name);
        declaration.type = property.type;
        declaration.isArray = property.isArray;
        declarations.push_back(declaration);
    }
    auto shape = std::make_shared<const Pegasus::InstanceShape>(std::move(declarations));
    for (Pegasus::Uint32 i = 0; i < shape->size(); ++i) {
        if (shape->find(shape->at(i).name) != i)
            throw std::logic_error(std::string(properties[i].name) + " is built twice");
    }
    return shape;
}

}  // namespace

const BuiltShape& BuiltShapes::find(const char* className,
                                    const std::vector<BuiltProperty>& properties) {
    BuiltShape& built = shapes[className];
    if (built.shape == nullptr || built.properties != properties) {
        built.className = Pegasus::CIMName(className);
        built.shape = shapeOf(properties);
        built.properties = properties;
    }
    return built;
}

}  // namespace cimomd
