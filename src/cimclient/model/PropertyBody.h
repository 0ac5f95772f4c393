// What the copies of a CIMProperty share.
#pragma once

#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMQualifier.h>
#include <Pegasus/Common/CIMValue.h>
#include <Pegasus/Common/SharedBody.h>

#include <utility>

#include "NamedList.h"

namespace Pegasus {

class PropertyBody : public SharedBody {
  public:
    PropertyBody(CIMName name, CIMValue value) : name(std::move(name)), value(std::move(value)) {}
    /// Copies deeply, unlike the handles' own copies.
    PropertyBody(const PropertyBody& other)
        : SharedBody(other),
          name(other.name),
          value(other.value.clone()),
          arraySize(other.arraySize),
          propagated(other.propagated),
          referenceClass(other.referenceClass),
          classOrigin(other.classOrigin),
          qualifiers(other.qualifiers.clone()) {}

    CIMName name;
    CIMValue value;
    Uint32 arraySize = 0;
    Boolean propagated = false;
    CIMName referenceClass;
    CIMName classOrigin;
    NamedList<CIMQualifier> qualifiers;
};

}  // namespace Pegasus
