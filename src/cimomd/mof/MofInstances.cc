#include "mof/MofInstances.h"

#include <Pegasus/Common/Exception.h>
#include <fmt/format.h>

#include <algorithm>
#include <utility>

#include "mof/MofToken.h"
#include "text/CimText.h"
#include "text/Utf8.h"

namespace cimomd {
namespace {

using Pegasus::CIMConstProperty;
using Pegasus::CIMKeyBinding;
using Pegasus::CIMName;
using Pegasus::CIMObjectPath;
using Pegasus::CIMValue;
using Pegasus::Uint32;

std::string aliasText(const MofName& alias) {
    return shownText("$" + alias.text);
}

}  // namespace

void MofInstances::declare(MofInstance declaration, const MofContextPointer& context) {
    const CIMName name = nameOf(declaration.className);
    if (context->repository.findClass(context->nameSpace, name) == nullptr &&
        classes.isHeldBack(*context, name))
        late.push_back({std::move(declaration), context});
    else
        build(declaration, context);
}

void MofInstances::build(const MofInstance& declaration, const MofContextPointer& context) {
    if (declaration.alias)
        declareAlias(*declaration.alias, *context);
    if (!canHaveInstances(declaration.className, *context))
        return;
    const CIMName name = nameOf(declaration.className);
    const MofInstanceClass& instanceClass = classOf(name, *context);
    propertyCount += instanceClass.defaults().size() + 1;
    if (propertyCount > kMaxProperties) {
        context->report(declaration.className.position, "too many instances",
                        fmt::format("at most {} properties in all of them", kMaxProperties));
        return;
    }
    const bool isClassFaulty = classes.isFaulty(*context, name);
    Entry entry{buildInstance(declaration, instanceClass, isClassFaulty, *context), &instanceClass,
                declaration.className.position, context};
    entry.built.isComplete = entry.built.isComplete && !isClassFaulty;
    entries.push_back(std::move(entry));
    if (declaration.alias)
        aliases[lowerCase(declaration.alias->text)] = &entries.back();
}

bool MofInstances::canHaveInstances(const MofName& name, const MofContext& context) const {
    const CIMName className = nameOf(name);
    const auto* found = context.repository.findClass(context.nameSpace, className);
    const bool isFaulty = classes.isFaulty(context, className);
    if (found == nullptr && !isFaulty)
        context.report(name.position, fmt::format("class {}", shownText(name.text)),
                       "a class that is declared");
    if (found == nullptr)
        return false;
    if (found->isAbstract())
        context.report(name.position, fmt::format("the abstract class {}", shownText(name.text)),
                       "a class that can have instances");
    return !found->isAbstract();
}

const MofInstanceClass& MofInstances::classOf(const CIMName& name, const MofContext& context) {
    const std::string key = keyOf(context.nameSpace, name);
    const auto place = instanceClasses.find(key);
    if (place != instanceClasses.end())
        return place->second;
    const auto* found = context.repository.findClass(context.nameSpace, name);
    return instanceClasses.emplace(key, MofInstanceClass(*found)).first->second;
}

void MofInstances::declareAlias(const MofName& alias, const MofContext& context) {
    if (!aliases.emplace(lowerCase(alias.text), nullptr).second)
        context.report(alias.position, fmt::format("alias {} again", aliasText(alias)),
                       "an alias that no other instance has");
}

void MofInstances::finish() {
    for (const Late& instance : late)
        build(instance.declaration, instance.context);
    for (Entry& entry : entries)
        resolvePath(entry, 0);
    for (Entry& entry : entries) {
        for (const MofAliasUse& use : entry.built.aliasUses) {
            if (!isKey(use, entry))
                resolve(use, entry, 0);
        }
        if (entry.state != PathState::Known)
            continue;
        for (const RepositoryError& error :
             entry.context->repository.addInstance(entry.built.instance))
            entry.context->report(entry.position, error.found, error.expected);
    }
}

/// Resolves the keys that are aliases first, and so the paths of their instances.
void MofInstances::resolvePath(Entry& entry, std::size_t depth) {
    if (entry.state != PathState::Open)
        return;
    entry.state = PathState::InProgress;
    bool isResolved = true;
    for (const MofAliasUse& use : entry.built.aliasUses) {
        if (isKey(use, entry) && !resolve(use, entry, depth))
            isResolved = false;
    }
    entry.state = PathState::Failed;
    if (isResolved && hasKeys(entry))
        setPath(entry);
}

bool MofInstances::hasKeys(const Entry& entry) const {
    bool hasAll = true;
    for (const std::size_t key : entry.instanceClass->keys()) {
        const CIMConstProperty property =
            entry.built.instance.getProperty(static_cast<Uint32>(key));
        if (!property.getValue().isNull())
            continue;
        hasAll = false;
        if (entry.built.isComplete)
            entry.context->report(
                entry.position,
                fmt::format("an instance of {} without its key {}",
                            utf8Of(entry.built.instance.getClassName().getString()),
                            utf8Of(property.getName().getString())),
                "a value for each key");
    }
    return hasAll;
}

void MofInstances::setPath(Entry& entry) {
    Pegasus::CIMInstance& instance = entry.built.instance;
    Pegasus::Array<CIMKeyBinding> keys;
    std::size_t characters = 0;
    for (const std::size_t key : entry.instanceClass->keys()) {
        const CIMConstProperty property = instance.getProperty(static_cast<Uint32>(key));
        try {
            keys.append(CIMKeyBinding(property.getName(), property.getValue()));
        } catch (const Pegasus::Exception&) {
            entry.context->report(
                entry.position,
                fmt::format("an instance with the {}{} {} as a key",
                            Pegasus::cimTypeToString(property.getType()),
                            property.isArray() ? "[]" : "", utf8Of(property.getName().getString())),
                "keys that are neither arrays nor reals");
            return;
        }
        characters += keys[keys.size() - 1].getValue().size();
        if (characters > kMaxKeyCharacters) {
            entry.context->report(entry.position, "an instance with too long keys",
                                  fmt::format("at most {} characters", kMaxKeyCharacters));
            return;
        }
    }
    instance.setPath(
        CIMObjectPath(Pegasus::String(), entry.context->nameSpace, instance.getClassName(), keys));
    entry.state = PathState::Known;
}

/// Sets the property to the path of the instance. False when that failed.
bool MofInstances::resolve(const MofAliasUse& use, Entry& entry, std::size_t depth) {
    const MofContext& context = *entry.context;
    Entry* found = target(use, context);
    if (found == nullptr || !fits(use, entry, *found))
        return false;
    if (found->state == PathState::InProgress || depth == kMaxKeyDepth) {
        context.report(use.alias.position, fmt::format("alias {}", aliasText(use.alias)),
                       fmt::format("an instance with keys of its own, at most {} instances away",
                                   kMaxKeyDepth));
        return false;
    }
    resolvePath(*found, depth + 1);
    if (found->state != PathState::Known)
        return false;
    entry.built.instance.getProperty(use.property)
        .setValue(CIMValue(found->built.instance.getPath()));
    return true;
}

/// Null, and in the log when it is news, if there is none.
MofInstances::Entry* MofInstances::target(const MofAliasUse& use, const MofContext& context) {
    const auto place = aliases.find(lowerCase(use.alias.text));
    if (place != aliases.end())
        return place->second;
    context.report(use.alias.position, fmt::format("alias {}", aliasText(use.alias)),
                   "an alias that is declared");
    return nullptr;
}

bool MofInstances::fits(const MofAliasUse& use, const Entry& entry, const Entry& target) {
    const MofContext& context = *entry.context;
    const CIMName& wanted = entry.built.instance.getProperty(use.property).getReferenceClassName();
    const CIMName& given = target.built.instance.getClassName();
    const bool isWantedKnown = context.repository.findClass(context.nameSpace, wanted) != nullptr &&
                               target.context->nameSpace.equal(context.nameSpace);
    if (!isWantedKnown || context.repository.isSameOrSubclass(context.nameSpace, given, wanted))
        return true;
    context.report(
        use.alias.position,
        fmt::format("alias {}, an instance of {}", aliasText(use.alias), utf8Of(given.getString())),
        fmt::format("an instance of {}", utf8Of(wanted.getString())));
    return false;
}

bool MofInstances::isKey(const MofAliasUse& use, const Entry& entry) {
    const std::vector<std::size_t>& keys = entry.instanceClass->keys();
    return std::binary_search(keys.begin(), keys.end(), use.property);
}

}  // namespace cimomd
