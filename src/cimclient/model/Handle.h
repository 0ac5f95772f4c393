// What the handle classes check before they use or make a body.
#pragma once

#include <Pegasus/Common/BodyRef.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/Exception.h>

namespace Pegasus {

/// The body, or UninitializedObjectException for a default-constructed handle.
template <class Body>
Body& requireBody(const BodyRef<Body>& body, const char* handleClass) {
    if (!body)
        throw UninitializedObjectException("The " + String(handleClass) +
                                           " was used before anything was assigned to it");
    return *body.get();
}

/// The name itself, or UninitializedObjectException when it is null.
inline const CIMName& requireName(const CIMName& name, const char* handleClass) {
    if (name.isNull())
        throw UninitializedObjectException("A " + String(handleClass) +
                                           " cannot have the null name");
    return name;
}

}  // namespace Pegasus
