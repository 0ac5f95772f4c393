#include "mof/MofInstanceBuilder.h"

#include <fmt/format.h>

#include <set>
#include <utility>

#include "mof/MofQualifiers.h"
#include "mof/MofToken.h"
#include "mof/MofValue.h"
#include "text/CimText.h"

namespace cimomd {
namespace {

using Pegasus::CIMName;
using Pegasus::CIMObjectPath;
using Pegasus::CIMProperty;
using Pegasus::CIMValue;

const MofAlias* aliasIn(const MofLiteral& literal) {
    if (literal.isArray)
        return nullptr;
    return std::get_if<MofAlias>(&literal.elements.front().value);
}

MofType typeOf(const CIMProperty& property) {
    MofType type;
    type.type = property.getType();
    type.isArray = property.isArray();
    type.arraySize = property.getArraySize();
    return type;
}

/// A path is relative to the namespace of its instance. The classes of other namespaces may be
/// anything.
CIMValue absolute(const CIMValue& value, const CIMProperty& property, MofPosition position,
                  const MofContext& context) {
    if (value.isNull())
        return value;
    CIMObjectPath path;
    value.get(path);
    if (path.getNameSpace().isNull())
        path.setNameSpace(context.nameSpace);
    const CIMName& wanted = property.getReferenceClassName();
    const bool isLocal = path.getNameSpace().equal(context.nameSpace);
    if (isLocal && context.repository.findClass(context.nameSpace, wanted) != nullptr &&
        !context.repository.isSameOrSubclass(context.nameSpace, path.getClassName(), wanted))
        throw MofError(context.file(), position,
                       fmt::format("a path of class {}", utf8Of(path.getClassName().getString())),
                       fmt::format("one of class {}", utf8Of(wanted.getString())));
    return CIMValue(path);
}

/// Fills in the values of one instance.
class ValueFiller {
  public:
    ValueFiller(const MofInstanceClass& instanceClass, bool isClassFaulty,
                const MofContext& context)
        : instanceClass(instanceClass),
          isClassFaulty(isClassFaulty),
          context(context),
          properties(instanceClass.defaults()) {}

    void set(const MofPropertyValue& value) {
        qualifiersOf(value.qualifiers, kScopeProperty | kScopeReference, "a property", context);
        const std::optional<std::size_t> position = instanceClass.find(nameOf(value.name));
        if (!position) {
            isComplete = false;
            if (!isClassFaulty)
                fail(value.name, "a property of the class");
        } else if (!named.insert(*position).second) {
            fail(value.name, "each property once");
        } else {
            set(*position, value.value);
        }
    }

    BuiltInstance take(const CIMName& className) {
        BuiltInstance out{Pegasus::CIMInstance(className), std::move(aliasUses), isComplete};
        for (const CIMProperty& property : properties)
            out.instance.addProperty(property);
        return out;
    }

  private:
    void set(std::size_t position, const MofLiteral& literal) {
        CIMProperty& property = properties[position];
        const bool isReference = property.getType() == Pegasus::CIMTYPE_REFERENCE;
        const MofAlias* alias = aliasIn(literal);
        if (isReference && alias != nullptr) {
            aliasUses.push_back({static_cast<Pegasus::Uint32>(position),
                                 {alias->name, literal.elements.front().position}});
            property = withValue(property, nullOf(typeOf(property)));
            return;
        }
        try {
            const CIMValue value = cimValueOf(literal, typeOf(property), context.file());
            property = withValue(
                property,
                isReference ? absolute(value, property, literal.position, context) : value);
        } catch (const MofError& error) {
            isComplete = false;
            context.log.add(context.file(), error);
        }
    }

    void fail(const MofName& name, std::string_view expected) const {
        context.report(name.position, quotedText(name.text), expected);
    }

    const MofInstanceClass& instanceClass;
    bool isClassFaulty;
    const MofContext& context;
    std::vector<CIMProperty> properties;
    std::set<std::size_t> named;
    std::vector<MofAliasUse> aliasUses;
    bool isComplete = true;
};

}  // namespace

BuiltInstance buildInstance(const MofInstance& declaration, const MofInstanceClass& instanceClass,
                            bool isClassFaulty, const MofContext& context) {
    qualifiersOf(declaration.qualifiers, kScopeClass | kScopeAssociation | kScopeIndication,
                 "an instance", context);
    ValueFiller filler(instanceClass, isClassFaulty, context);
    for (const MofPropertyValue& value : declaration.values)
        filler.set(value);
    BuiltInstance out = filler.take(nameOf(declaration.className));
    out.isComplete = out.isComplete && declaration.isComplete;
    return out;
}

}  // namespace cimomd
