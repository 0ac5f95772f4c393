// The properties of a class or an instance, in whichever form suits them.
#pragma once

#include <Pegasus/Common/CIMProperty.h>

#include <utility>
#include <variant>

#include "NamedList.h"
#include "PackedProperties.h"

namespace Pegasus {

/// A list that can be changed, or packed properties. Whatever may change the properties makes a
/// list of packed ones first.
class PropertyStore {
  public:
    PropertyStore() = default;
    explicit PropertyStore(BodyRef<PackedProperties> packed) : form(std::move(packed)) {}

    Uint32 size() const { return packed() ? packed()->size() : list().size(); }
    /// The position, or PEG_NOT_FOUND.
    Uint32 find(const CIMName& name) const {
        return packed() ? packed()->find(name) : list().find(name);
    }
    /// Raises IndexOutOfBoundsException.
    CIMConstProperty at(Uint32 index) const;
    /// The property itself, through which it can be changed. Raises IndexOutOfBoundsException.
    CIMProperty changeable(Uint32 index) { return unpackedList().at(index); }

    /// As NamedList::add().
    void add(CIMProperty property, const CIMName& owner) {
        unpackedList().add(std::move(property), "property", owner);
    }

    /// Null when they are in a list.
    PackedProperties* packed() const {
        const auto* const held = std::get_if<Packed>(&form);
        return held ? held->get() : nullptr;
    }

    /// A copy that shares nothing that can be changed.
    PropertyStore clone() const;

  private:
    using List = NamedList<CIMProperty>;
    using Packed = BodyRef<PackedProperties>;

    const List& list() const { return *std::get_if<List>(&form); }
    List& unpackedList();

    std::variant<List, Packed> form;
};

}  // namespace Pegasus
