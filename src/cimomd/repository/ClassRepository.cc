#include "repository/ClassRepository.h"

#include <fmt/format.h>

#include <utility>

#include "repository/Inheritance.h"
#include "text/CimText.h"
#include "text/Utf8.h"

namespace cimomd {
namespace {

using Pegasus::CIMClass;
using Pegasus::CIMName;
using Pegasus::CIMNamespaceName;

std::string keyOf(const CIMName& name) {
    return lowerCase(utf8Of(name.getString()));
}

std::string keyOf(const CIMNamespaceName& name) {
    return lowerCase(utf8Of(name.getString()));
}

}  // namespace

void ClassRepository::addNamespace(const CIMNamespaceName& name) {
    namespaces[keyOf(name)];
}

bool ClassRepository::hasNamespace(const CIMNamespaceName& name) const {
    return find(name) != nullptr;
}

void ClassRepository::addQualifier(const CIMNamespaceName& nameSpace,
                                   QualifierDeclaration declaration) {
    const CIMName name = declaration.name;
    const auto [place, added] =
        namespaces[keyOf(nameSpace)].qualifiers.emplace(keyOf(name), std::move(declaration));
    if (!added)
        throw RepositoryError{CIMName(), name,
                              fmt::format("qualifier {} again", utf8Of(name.getString())),
                              "a qualifier that is not declared yet"};
}

const QualifierDeclaration* ClassRepository::findQualifier(const CIMNamespaceName& nameSpace,
                                                           const CIMName& name) const {
    const Namespace* space = find(nameSpace);
    if (space == nullptr)
        return nullptr;
    const auto place = space->qualifiers.find(keyOf(name));
    return place == space->qualifiers.end() ? nullptr : &place->second;
}

void ClassRepository::addClass(const CIMNamespaceName& nameSpace, CIMClass declared) {
    Namespace& space = namespaces[keyOf(nameSpace)];
    const CIMName& name = declared.getClassName();
    const CIMName& superName = declared.getSuperClassName();
    if (find(space, name) != nullptr)
        throw RepositoryError{CIMName(), CIMName(),
                              fmt::format("class {} again", utf8Of(name.getString())),
                              "a class that is not declared yet"};
    if (superName.isNull()) {
        space.classes.emplace(keyOf(name), ClassEntry{asTopClass(declared), {}, 0});
        return;
    }
    const auto super = space.classes.find(keyOf(superName));
    if (super == space.classes.end())
        throw RepositoryError{CIMName(), CIMName(),
                              fmt::format("superclass {}", utf8Of(superName.getString())),
                              "a class declared before", true};
    const std::size_t depth = super->second.depth + 1;
    if (depth > kMaxInheritanceDepth)
        throw RepositoryError{CIMName(), CIMName(), fmt::format("a class {} levels deep", depth),
                              fmt::format("at most {}", kMaxInheritanceDepth)};
    checkOverrides(super->second.effective, declared);
    space.classes.emplace(keyOf(name),
                          ClassEntry{inherit(super->second.effective, declared), {}, depth});
    super->second.subclasses.push_back(keyOf(name));
}

const Pegasus::CIMConstClass* ClassRepository::findClass(const CIMNamespaceName& nameSpace,
                                                         const CIMName& name) const {
    const Namespace* space = find(nameSpace);
    const ClassEntry* entry = space == nullptr ? nullptr : find(*space, name);
    return entry == nullptr ? nullptr : &entry->effective;
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
        for (auto key = entry->subclasses.rbegin(); key != entry->subclasses.rend(); ++key)
            open.push_back(&space->classes.at(*key));
    }
    return names;
}

const ClassRepository::Namespace* ClassRepository::find(const CIMNamespaceName& name) const {
    const auto place = namespaces.find(keyOf(name));
    return place == namespaces.end() ? nullptr : &place->second;
}

const ClassRepository::ClassEntry* ClassRepository::find(const Namespace& nameSpace,
                                                         const CIMName& name) {
    const auto place = nameSpace.classes.find(keyOf(name));
    return place == nameSpace.classes.end() ? nullptr : &place->second;
}

}  // namespace cimomd
