// A class or an instance, whichever it is: what a value of type object embeds.
#pragma once

#include <Pegasus/Common/BodyRef.h>
#include <Pegasus/Common/CIMName.h>

namespace Pegasus {

class ObjectBody;
class CIMClass;
class CIMConstClass;
class CIMConstInstance;
class CIMConstProperty;
class CIMInstance;

/// A handle on a class or an instance, shared with the handle it was made of. Getters of a
/// default-constructed handle raise UninitializedObjectException. For what is not here make a
/// CIMClass or CIMInstance of it.
class CIMObject {
  public:
    CIMObject() = default;
    /// Raise UninitializedObjectException for a default-constructed handle.
    explicit CIMObject(const CIMClass& cimClass);
    explicit CIMObject(const CIMInstance& instance);

    Boolean isClass() const;
    Boolean isInstance() const;
    const CIMName& getClassName() const;
    Uint32 findProperty(const CIMName& name) const;
    CIMConstProperty getProperty(Uint32 index) const;
    Uint32 getPropertyCount() const;

    Boolean isUninitialized() const { return !body; }
    CIMObject clone() const;

  private:
    friend class CIMConstClass;
    friend class CIMConstInstance;
    explicit CIMObject(ObjectBody* newBody);
    ObjectBody& access() const;

    BodyRef<ObjectBody> body;
};

}  // namespace Pegasus

// Last, because a value can hold an object: CIMValue.h, which this includes, needs the above.
#include <Pegasus/Common/CIMProperty.h>
