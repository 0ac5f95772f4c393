// An instance while it is being read: packed as long as that can be done.

#pragma once

#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMProperty.h>
#include <Pegasus/Common/CIMQualifier.h>

#include <cstddef>
#include <memory>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "model/InstanceBody.h"
#include "model/PackedProperties.h"
#include "xml/KnownProperties.h"

namespace Pegasus {

/// One instance after the other: start(), what is in it, finish().
class InstanceAssembly {
  public:
    /// `className` is one of the names of a NameCache. Without `learning` nothing is packed, which
    /// is best for what is read once.
    void start(const CIMName& className, bool learning);

    /// A property that may come next, the `ahead`-th of those, counted from 0; nullptr when there
    /// is none.
    const KnownProperties::Property* expected(std::size_t ahead) const;
    const PropertyDeclaration& declaration(const KnownProperties::Property& property) const {
        return known->declaration(property.id);
    }
    /// Where the value of an expected property goes; then tookExpected() must follow.
    PropertyPacker& packer() { return packing; }
    void tookExpected(std::size_t ahead);

    /// Adds a property that was read in the general way; `element` are its octets, or empty.
    /// Raises AlreadyExistsException.
    void addProperty(const CIMProperty& property, std::string_view element);
    /// Raises AlreadyExistsException.
    void addQualifier(const CIMQualifier& qualifier) { body->addQualifier(qualifier); }

    CIMInstance finish();

  private:
    bool pack(const CIMProperty& property, std::string_view element);
    bool hasPacked(const CIMName& name) const;
    void unpack();

    std::unique_ptr<InstanceBody> body;
    std::unordered_map<const CIMName*, KnownProperties> classes;
    // Those of the current instance's class while it is being packed, otherwise nullptr.
    KnownProperties* known = nullptr;
    PropertyPacker packing;
    // The declarations of the properties packed so far, and the position behind the latest one. No
    // property from there on has the name of an earlier one.
    std::vector<Uint32> ids;
    std::size_t next = 0;
};

}  // namespace Pegasus
