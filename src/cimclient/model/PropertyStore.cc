#include "PropertyStore.h"

#include <Pegasus/Common/Exception.h>

namespace Pegasus {

CIMConstProperty PropertyStore::at(Uint32 index) const {
    if (!packed())
        return list().at(index);
    if (index >= size())
        throw IndexOutOfBoundsException(index, size());
    return CIMConstProperty(std::get<Packed>(form), index);
}

PropertyStore::List& PropertyStore::unpackedList() {
    if (const PackedProperties* const properties = packed()) {
        List unpacked;
        for (Uint32 i = 0; i < properties->size(); ++i)
            unpacked.add(properties->at(i), "property", CIMName());
        form = std::move(unpacked);
    }
    return std::get<List>(form);
}

PropertyStore PropertyStore::clone() const {
    PropertyStore copy;
    if (packed())
        copy.form = std::get<Packed>(form);
    else
        copy.form = list().clone();
    return copy;
}

}  // namespace Pegasus
