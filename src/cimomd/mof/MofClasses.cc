#include "mof/MofClasses.h"

#include <fmt/format.h>

#include <utility>

#include "mof/MofClassBuilder.h"
#include "mof/MofToken.h"
#include "text/CimText.h"

namespace cimomd {
namespace {

using Pegasus::CIMName;

void reportSuperClass(const MofName& superClass, const MofContext& context) {
    context.report(superClass.position, fmt::format("superclass {}", shownText(superClass.text)),
                   "a class that is declared");
}

/// Whether one of the classes of two references is the other or below it. Hierarchies change from
/// version to version of a schema, so that an override may have become the wider one.
bool areRelated(const CIMName& a, const CIMName& b, const MofContext& context) {
    return context.repository.isSameOrSubclass(context.nameSpace, a, b) ||
           context.repository.isSameOrSubclass(context.nameSpace, b, a);
}

}  // namespace

void MofClasses::declare(MofClass declaration, const MofContextPointer& context) {
    if (declaration.superClass && nameOf(*declaration.superClass).equal(nameOf(declaration.name))) {
        refuseOwnSuperClass(declaration, *context);
        return;
    }
    const bool hasSuperClass =
        !declaration.superClass ||
        context->repository.findClass(context->nameSpace, nameOf(*declaration.superClass));
    if (hasSuperClass)
        add(declaration, context);
    else
        keepWaiting(std::move(declaration), context);
}

/// What is wrong in the class itself is told nevertheless.
void MofClasses::refuseOwnSuperClass(const MofClass& declaration, const MofContext& context) {
    context.report(declaration.superClass->position,
                   fmt::format("class {} as its own superclass", shownText(declaration.name.text)),
                   "another class");
    buildClass(declaration, context);
    faulty.insert(keyOf(context.nameSpace, nameOf(declaration.name)));
}

/// Adds those that wait for the class too. The repository bounds how deep this goes.
void MofClasses::add(const MofClass& declaration, const MofContextPointer& context) {
    const std::string key = keyOf(context->nameSpace, nameOf(declaration.name));
    const std::size_t before = context->log.count();
    BuiltClass built = buildClass(declaration, *context);
    noteReferences(declaration, context);
    const RepositoryErrors errors = context->repository.addClass(
        context->nameSpace, std::move(built.cimClass), std::move(built.methods));
    for (const RepositoryError& error : errors)
        context->report(positionOf(error, declaration), error.found, error.expected);
    if (errors.empty()) {
        noteOverrides(declaration, context);
        checkAsAssociation(declaration, *context);
    }
    if (!declaration.isComplete || context->log.count() != before)
        faulty.insert(key);
    if (!errors.empty())
        return;
    const auto place = waiting.extract(key);
    if (place.empty())
        return;
    for (const Waiting& entry : place.mapped())
        add(entry.declaration, entry.context);
}

void MofClasses::keepWaiting(MofClass declaration, const MofContextPointer& context) {
    if (heldBack.size() == kMaxOpen) {
        reportSuperClass(*declaration.superClass, *context);
        return;
    }
    heldBack.insert(keyOf(context->nameSpace, nameOf(declaration.name)));
    const std::string superKey = keyOf(context->nameSpace, nameOf(*declaration.superClass));
    waiting[superKey].push_back({std::move(declaration), context});
}

void MofClasses::noteReferences(const MofClass& declaration, const MofContextPointer& context) {
    for (const MofProperty& property : declaration.properties) {
        const MofName& name = property.type.referenceClass;
        if (name.text.empty() ||
            context->repository.findClass(context->nameSpace, nameOf(name)) != nullptr)
            continue;
        if (referenced.size() == kMaxOpen)
            context->report(name.position, fmt::format("class {}", shownText(name.text)),
                            "a class that is declared before");
        else
            referenced.emplace(keyOf(context->nameSpace, nameOf(name)), Referenced{name, context});
    }
}

void MofClasses::noteOverrides(const MofClass& declaration, const MofContextPointer& context) {
    const auto* super =
        declaration.superClass
            ? context->repository.findClass(context->nameSpace, nameOf(*declaration.superClass))
            : nullptr;
    for (const MofProperty& property : declaration.properties) {
        const MofName& name = property.type.referenceClass;
        const Pegasus::Uint32 index = super == nullptr || name.text.empty()
                                          ? Pegasus::PEG_NOT_FOUND
                                          : super->findProperty(nameOf(property.name));
        if (index == Pegasus::PEG_NOT_FOUND)
            continue;
        const CIMName inherited = super->getProperty(index).getReferenceClassName();
        if (!areRelated(nameOf(name), inherited, *context) &&
            overriddenReferences.size() < kMaxOpen)
            overriddenReferences.push_back({name, inherited, context});
    }
}

void MofClasses::reportOverrides() const {
    for (const OverriddenReference& reference : overriddenReferences) {
        const MofContext& context = *reference.context;
        const CIMName given = nameOf(reference.name);
        const bool areKnown =
            context.repository.findClass(context.nameSpace, given) != nullptr &&
            context.repository.findClass(context.nameSpace, reference.inherited) != nullptr;
        if (areKnown && !areRelated(given, reference.inherited, context))
            context.report(reference.name.position,
                           fmt::format("class {}", shownText(reference.name.text)),
                           fmt::format("the inherited class {} or one below it",
                                       utf8Of(reference.inherited.getString())));
    }
}

void MofClasses::checkAsAssociation(const MofClass& declaration, const MofContext& context) const {
    const auto* built = context.repository.findClass(context.nameSpace, nameOf(declaration.name));
    if (!declaration.isComplete || !built->isAssociation() || built->isAbstract())
        return;
    for (Pegasus::Uint32 i = 0; i < built->getPropertyCount(); ++i) {
        if (built->getProperty(i).getType() == Pegasus::CIMTYPE_REFERENCE)
            return;
    }
    context.report(
        declaration.name.position,
        fmt::format("association {} without references", shownText(declaration.name.text)),
        "references to the classes that it connects");
}

void MofClasses::finish() {
    std::vector<std::string> undeclared;
    for (const auto& [superKey, entries] : waiting) {
        if (heldBack.count(superKey) == 0)
            undeclared.push_back(superKey);
    }
    for (const std::string& superKey : undeclared)
        giveUpWaitingFor(superKey);
    // What is left are classes that are each other's superclass.
    while (!waiting.empty())
        giveUpWaitingFor(std::string(waiting.begin()->first));
    reportReferences();
    reportOverrides();
}

void MofClasses::giveUpWaitingFor(const std::string& superKey) {
    std::vector<std::string> open{superKey};
    while (!open.empty()) {
        const std::string key = open.back();
        open.pop_back();
        const auto place = waiting.extract(key);
        if (place.empty())
            continue;
        const bool isSuperFaulty = faulty.count(key) != 0;
        for (const Waiting& entry : place.mapped()) {
            giveUp(entry, isSuperFaulty);
            open.push_back(keyOf(entry.context->nameSpace, nameOf(entry.declaration.name)));
        }
    }
}

/// What is wrong in the class itself is told nevertheless.
void MofClasses::giveUp(const Waiting& entry, bool isSuperFaulty) {
    if (!isSuperFaulty)
        reportSuperClass(*entry.declaration.superClass, *entry.context);
    buildClass(entry.declaration, *entry.context);
    faulty.insert(keyOf(entry.context->nameSpace, nameOf(entry.declaration.name)));
}

void MofClasses::reportReferences() const {
    for (const auto& [key, reference] : referenced) {
        const MofContext& context = *reference.context;
        const bool isDeclared =
            context.repository.findClass(context.nameSpace, nameOf(reference.name)) != nullptr;
        if (!isDeclared && faulty.count(key) == 0)
            context.report(reference.name.position,
                           fmt::format("class {}", shownText(reference.name.text)),
                           "a class that is declared");
    }
}

bool MofClasses::isHeldBack(const MofContext& context, const CIMName& name) const {
    return heldBack.count(keyOf(context.nameSpace, name)) != 0;
}

bool MofClasses::isFaulty(const MofContext& context, const CIMName& name) const {
    if (faulty.empty())
        return false;
    for (CIMName current = name; !current.isNull();) {
        if (faulty.count(keyOf(context.nameSpace, current)) != 0)
            return true;
        const auto* found = context.repository.findClass(context.nameSpace, current);
        current = found == nullptr ? CIMName() : found->getSuperClassName();
    }
    return false;
}

}  // namespace cimomd
