#include "repository/ClassRepository.h"

#include <fmt/format.h>

#include <utility>

#include "repository/Inheritance.h"
#include "repository/MethodInheritance.h"
#include "text/CimText.h"
#include "text/Utf8.h"

namespace cimomd {
namespace {

using Pegasus::CIMClass;
using Pegasus::CIMConstInstance;
using Pegasus::CIMName;
using Pegasus::CIMNamespaceName;

std::string keyOf(const CIMNamespaceName& name) {
    return lowerCase(utf8Of(name.getString()));
}

RepositoryError errorOf(std::string found, std::string expected) {
    RepositoryError error;
    error.found = std::move(found);
    error.expected = std::move(expected);
    return error;
}

/// What the class costs in a subclass, which shares what is propagated already.
std::size_t elementsOf(const Pegasus::CIMConstClass& cimClass) {
    std::size_t count = 1 + cimClass.getQualifierCount() + cimClass.getPropertyCount();
    for (Pegasus::Uint32 i = 0; i < cimClass.getPropertyCount(); ++i) {
        const Pegasus::CIMConstProperty property = cimClass.getProperty(i);
        if (!property.getPropagated())
            count += property.getQualifierCount();
    }
    return count;
}

std::size_t elementsOf(const MethodDeclaration& method) {
    std::size_t count = 1 + method.qualifiers.size();
    for (const ParameterDeclaration& parameter : method.parameters)
        count += 1 + parameter.qualifiers.size();
    return count;
}

std::size_t elementsOf(const std::vector<MethodDeclaration>& methods) {
    std::size_t count = 0;
    for (const MethodDeclaration& method : methods)
        count += elementsOf(method);
    return count;
}

std::size_t elementsOf(const MethodList& methods) {
    std::size_t count = 0;
    for (const auto& method : methods)
        count += method->isPropagated ? 1 : elementsOf(*method);
    return count;
}

std::shared_ptr<const MethodList> shared(MethodList methods) {
    return methods.empty() ? nullptr : std::make_shared<const MethodList>(std::move(methods));
}

}  // namespace

void ClassRepository::addNamespace(const CIMNamespaceName& name) {
    access(name);
}

bool ClassRepository::hasNamespace(const CIMNamespaceName& name) const {
    return find(name) != nullptr;
}

std::vector<CIMNamespaceName> ClassRepository::namespaceNames() const {
    std::vector<CIMNamespaceName> names;
    for (const auto& [key, space] : namespaces)
        names.push_back(space.name);
    return names;
}

RepositoryErrors ClassRepository::addQualifier(const CIMNamespaceName& nameSpace,
                                               QualifierDeclaration declaration) {
    const CIMName name = declaration.name;
    auto& qualifiers = access(nameSpace).qualifiers;
    const auto place = qualifiers.find(name);
    if (place == qualifiers.end()) {
        qualifiers.emplace(name, std::move(declaration));
        return {};
    }
    if (place->second.isSameAs(declaration))
        return {};
    return {errorOf(fmt::format("another declaration of qualifier {}", utf8Of(name.getString())),
                    "one that says the same as the first")};
}

const QualifierDeclaration* ClassRepository::findQualifier(const CIMNamespaceName& nameSpace,
                                                           const CIMName& name) const {
    const Namespace* space = find(nameSpace);
    if (space == nullptr)
        return nullptr;
    const auto place = space->qualifiers.find(name);
    return place == space->qualifiers.end() ? nullptr : &place->second;
}

RepositoryErrors ClassRepository::addClass(const CIMNamespaceName& nameSpace, CIMClass declared,
                                           std::vector<MethodDeclaration> methods) {
    Namespace& space = access(nameSpace);
    if (find(space, declared.getClassName()) != nullptr)
        return {errorOf(fmt::format("class {} again", utf8Of(declared.getClassName().getString())),
                        "a class that is not declared yet")};
    const CIMName& superName = declared.getSuperClassName();
    if (superName.isNull())
        return addTopClass(space, std::move(declared), std::move(methods));
    const auto super = space.classes.find(superName);
    if (super != space.classes.end())
        return addSubclass(space, super->second, std::move(declared), std::move(methods));
    RepositoryError error = errorOf(fmt::format("superclass {}", utf8Of(superName.getString())),
                                    "a class that is declared");
    error.atSuperClass = true;
    return {error};
}

RepositoryErrors ClassRepository::addTopClass(Namespace& space, CIMClass declared,
                                              std::vector<MethodDeclaration> methods) {
    const CIMName name = declared.getClassName();
    RepositoryErrors errors = reserve(declared.getPropertyCount() + methods.size(),
                                      elementsOf(declared) + elementsOf(methods));
    if (!errors.empty())
        return errors;
    ClassEntry entry;
    entry.methods = shared(inheritMethods(MethodList(), std::move(methods), name));
    entry.effective = asTopClass(std::move(declared));
    space.classes.emplace(name, std::move(entry));
    space.topClasses.push_back(name);
    return {};
}

RepositoryErrors ClassRepository::addSubclass(Namespace& space, ClassEntry& super,
                                              CIMClass declared,
                                              std::vector<MethodDeclaration> methods) {
    static const MethodList kNone;
    const MethodList& inherited = super.methods ? *super.methods : kNone;
    const CIMName name = declared.getClassName();
    ClassEntry entry;
    entry.depth = super.depth + 1;
    if (entry.depth > kMaxInheritanceDepth)
        return {errorOf(fmt::format("a class {} levels deep", entry.depth),
                        fmt::format("at most {}", kMaxInheritanceDepth))};
    RepositoryErrors errors = reserve(super.effective.getPropertyCount() + inherited.size() +
                                          declared.getPropertyCount() + methods.size(),
                                      elementsOf(super.effective) + elementsOf(declared) +
                                          elementsOf(inherited) + elementsOf(methods));
    if (!errors.empty())
        return errors;
    errors = checkOverrides(super.effective, declared);
    checkMethodOverrides(inherited, methods, errors);
    if (!errors.empty())
        return errors;
    entry.methods = shared(inheritMethods(inherited, std::move(methods), name));
    entry.effective = inherit(super.effective, std::move(declared));
    space.classes.emplace(name, std::move(entry));
    super.subclasses.push_back(name);
    return {};
}

RepositoryErrors ClassRepository::reserve(std::size_t features, std::size_t elements) {
    if (features > kMaxFeatures)
        return {errorOf("a class with too many properties and methods",
                        fmt::format("at most {}", kMaxFeatures))};
    if (elements > kMaxElements - elementCount)
        return {errorOf("too many classes, properties, methods and qualifiers",
                        fmt::format("at most {}", kMaxElements))};
    elementCount += elements;
    return {};
}

const Pegasus::CIMConstClass* ClassRepository::findClass(const CIMNamespaceName& nameSpace,
                                                         const CIMName& name) const {
    const ClassEntry* entry = find(nameSpace, name);
    return entry == nullptr ? nullptr : &entry->effective;
}

const MethodList& ClassRepository::methodsOf(const CIMNamespaceName& nameSpace,
                                             const CIMName& className) const {
    static const MethodList kNone;
    const ClassEntry* entry = find(nameSpace, className);
    return entry == nullptr || !entry->methods ? kNone : *entry->methods;
}

std::vector<CIMName> ClassRepository::topClasses(const CIMNamespaceName& nameSpace) const {
    const Namespace* space = find(nameSpace);
    return space == nullptr ? std::vector<CIMName>() : space->topClasses;
}

std::vector<CIMName> ClassRepository::subclassesOf(const CIMNamespaceName& nameSpace,
                                                   const CIMName& name) const {
    const ClassEntry* entry = find(nameSpace, name);
    return entry == nullptr ? std::vector<CIMName>() : entry->subclasses;
}

std::vector<CIMName> ClassRepository::withDescendants(const CIMNamespaceName& nameSpace,
                                                      const CIMName& name) const {
    std::vector<CIMName> names;
    const Namespace* space = find(nameSpace);
    if (space == nullptr || find(*space, name) == nullptr)
        return names;
    std::vector<const ClassEntry*> open{find(*space, name)};
    while (!open.empty()) {
        const ClassEntry* entry = open.back();
        open.pop_back();
        names.push_back(entry->effective.getClassName());
        for (auto sub = entry->subclasses.rbegin(); sub != entry->subclasses.rend(); ++sub)
            open.push_back(find(*space, *sub));
    }
    return names;
}

bool ClassRepository::isSameOrSubclass(const CIMNamespaceName& nameSpace, const CIMName& name,
                                       const CIMName& ancestor) const {
    const Namespace* space = find(nameSpace);
    if (space == nullptr)
        return false;
    for (const ClassEntry* entry = find(*space, name); entry != nullptr;
         entry = find(*space, entry->effective.getSuperClassName())) {
        if (entry->effective.getClassName().equal(ancestor))
            return true;
    }
    return false;
}

RepositoryErrors ClassRepository::addInstance(const Pegasus::CIMInstance& instance) {
    const CIMName& className = instance.getClassName();
    Namespace& space = access(instance.getPath().getNameSpace());
    const auto place = space.classes.find(className);
    if (place == space.classes.end())
        return {errorOf(fmt::format("class {}", utf8Of(className.getString())),
                        "a class that is declared")};
    std::shared_ptr<InstanceTable>& table = place->second.instances;
    if (!table)
        table = std::make_shared<InstanceTable>();
    else if (table.use_count() > 1)
        table = std::make_shared<InstanceTable>(*table);
    if (table->add(instance))
        return {};
    return {errorOf(fmt::format("instance {} again", utf8Of(instance.getPath().toString())),
                    "keys that no other instance has")};
}

const std::vector<CIMConstInstance>& ClassRepository::instancesOf(const CIMNamespaceName& nameSpace,
                                                                  const CIMName& className) const {
    static const std::vector<CIMConstInstance> kNone;
    const ClassEntry* entry = find(nameSpace, className);
    return entry == nullptr || !entry->instances ? kNone : entry->instances->all();
}

const CIMConstInstance* ClassRepository::findInstance(const CIMNamespaceName& nameSpace,
                                                      const Pegasus::CIMObjectPath& path) const {
    const ClassEntry* entry = find(nameSpace, path.getClassName());
    if (entry == nullptr || !entry->instances)
        return nullptr;
    return entry->instances->find(nameSpace, path.getKeyBindings());
}

ClassRepository::Namespace& ClassRepository::access(const CIMNamespaceName& name) {
    Namespace& space = namespaces[keyOf(name)];
    if (space.name.isNull())
        space.name = name;
    return space;
}

const ClassRepository::Namespace* ClassRepository::find(const CIMNamespaceName& name) const {
    const auto place = namespaces.find(keyOf(name));
    return place == namespaces.end() ? nullptr : &place->second;
}

const ClassRepository::ClassEntry* ClassRepository::find(const CIMNamespaceName& nameSpace,
                                                         const CIMName& className) const {
    const Namespace* space = find(nameSpace);
    return space == nullptr ? nullptr : find(*space, className);
}

const ClassRepository::ClassEntry* ClassRepository::find(const Namespace& nameSpace,
                                                         const CIMName& name) {
    const auto place = nameSpace.classes.find(name);
    return place == nameSpace.classes.end() ? nullptr : &place->second;
}

}  // namespace cimomd
