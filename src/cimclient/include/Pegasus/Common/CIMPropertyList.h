// Which properties a client asks for: all of them (null), or the named ones.
#pragma once

#include <Pegasus/Common/Array.h>
#include <Pegasus/Common/CIMName.h>

namespace Pegasus {

class CIMPropertyList {
  public:
    /// The null list.
    CIMPropertyList() = default;
    CIMPropertyList(Array<CIMName> propertyNames);

    /// Makes the list not null, also for an empty array.
    void set(Array<CIMName> propertyNames);
    /// Makes the list null.
    void clear();
    Boolean isNull() const { return null; }
    /// 0 when null.
    Uint32 size() const { return names.size(); }
    /// Raises IndexOutOfBoundsException.
    const CIMName& operator[](Uint32 index) const { return names[index]; }
    const Array<CIMName>& getPropertyNameArray() const { return names; }

  private:
    Array<CIMName> names;
    Boolean null = true;
};

}  // namespace Pegasus
