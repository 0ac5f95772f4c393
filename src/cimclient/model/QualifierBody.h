// What the copies of a CIMQualifier share.
#pragma once

#include <Pegasus/Common/CIMFlavor.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMValue.h>
#include <Pegasus/Common/SharedBody.h>

#include <utility>

namespace Pegasus {

class QualifierBody : public SharedBody {
  public:
    QualifierBody(CIMName name, CIMValue value, CIMFlavor flavor, Boolean propagated)
        : name(std::move(name)), value(std::move(value)), flavor(flavor), propagated(propagated) {}

    CIMName name;
    CIMValue value;
    CIMFlavor flavor;
    Boolean propagated;
};

}  // namespace Pegasus
