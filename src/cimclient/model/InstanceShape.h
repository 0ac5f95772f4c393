// What the instances of one class, as one server words them, have in common: their properties but
// for the values.
#pragma once

#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMProperty.h>
#include <Pegasus/Common/CIMType.h>

#include <algorithm>
#include <utility>
#include <vector>

namespace Pegasus {

struct PropertyDeclaration {
    CIMName name;
    CIMType type = CIMTYPE_STRING;
    Boolean isArray = false;
    Boolean propagated = false;
    /// As in CIMConstProperty.
    Uint32 arraySize = 0;
    CIMName classOrigin;

    Boolean operator==(const PropertyDeclaration& other) const {
        return type == other.type && isArray == other.isArray && propagated == other.propagated &&
               arraySize == other.arraySize &&
               String::equal(name.getString(), other.name.getString()) &&
               String::equal(classOrigin.getString(), other.classOrigin.getString());
    }
};

inline PropertyDeclaration declarationOf(const CIMConstProperty& property) {
    return {property.getName(),       property.getType(),      property.isArray(),
            property.getPropagated(), property.getArraySize(), property.getClassOrigin()};
}

/// No two declarations have the same name, ignoring case.
class InstanceShape {
  public:
    explicit InstanceShape(std::vector<PropertyDeclaration> properties)
        : declarations(std::move(properties)) {
        hashes.reserve(declarations.size());
        for (const PropertyDeclaration& declaration : declarations)
            hashes.push_back(declaration.name.hash());
    }

    Boolean isOf(const std::vector<PropertyDeclaration>& properties) const {
        return declarations == properties;
    }
    Uint32 size() const { return static_cast<Uint32>(declarations.size()); }
    const PropertyDeclaration& at(Uint32 index) const { return declarations[index]; }

    /// The position, or PEG_NOT_FOUND.
    Uint32 find(const CIMName& name) const {
        const auto end = hashes.end();
        auto at = std::find(hashes.begin(), end, name.hash());
        while (at != end) {
            const auto index = static_cast<Uint32>(at - hashes.begin());
            if (declarations[index].name.equal(name))
                return index;
            at = std::find(at + 1, end, name.hash());
        }
        return PEG_NOT_FOUND;
    }

  private:
    std::vector<PropertyDeclaration> declarations;
    /// Of the names: a scan touches a name only where a hash fits.
    std::vector<Uint32> hashes;
};

}  // namespace Pegasus
