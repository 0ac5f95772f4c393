// A property of a class or an instance: a name, a value and, in classes, qualifiers (DSP0004).
#pragma once

#include <Pegasus/Common/BodyRef.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMQualifier.h>
#include <Pegasus/Common/CIMType.h>
#include <Pegasus/Common/CIMValue.h>

namespace Pegasus {

class CIMValue;
class PropertyBody;
class CIMProperty;

/// A handle that reads. Copies share one property. Getters of a default-constructed handle raise
/// UninitializedObjectException.
class CIMConstProperty {
  public:
    CIMConstProperty() = default;
    /// `arraySize` is the declared size of an array of fixed size, otherwise 0. `referenceClass`
    /// is that of a reference. `classOrigin` is the class that declared the property, `propagated`
    /// whether it was inherited. Raises UninitializedObjectException when `name` is null.
    CIMConstProperty(CIMName name, CIMValue value, Uint32 arraySize = 0,
                     CIMName referenceClass = CIMName(), CIMName classOrigin = CIMName(),
                     Boolean propagated = false);

    const CIMName& getName() const;
    const CIMValue& getValue() const;
    CIMType getType() const;
    Boolean isArray() const;
    /// The declared size of an array of fixed size; 0 for any other property.
    Uint32 getArraySize() const;
    const CIMName& getReferenceClassName() const;
    const CIMName& getClassOrigin() const;
    Boolean getPropagated() const;

    /// The position of the qualifier, or PEG_NOT_FOUND.
    Uint32 findQualifier(const CIMName& name) const;
    /// Raises IndexOutOfBoundsException.
    CIMConstQualifier getQualifier(Uint32 index) const;
    Uint32 getQualifierCount() const;

    Boolean isUninitialized() const { return !body; }
    CIMProperty clone() const;

  protected:
    explicit CIMConstProperty(PropertyBody* newBody);
    PropertyBody& access() const;

  private:
    BodyRef<PropertyBody> body;
};

/// The handle that also changes its property.
class CIMProperty : public CIMConstProperty {
  public:
    CIMProperty() = default;
    using CIMConstProperty::CIMConstProperty;

    /// Raises TypeMismatchException when `value` has another type than the property, or is an
    /// array where the property is none, or the reverse.
    void setValue(CIMValue value);
    void setClassOrigin(const CIMName& className);
    void setPropagated(Boolean propagated);

    /// Shares `qualifier`. Raises AlreadyExistsException when there is one of this name, and
    /// UninitializedObjectException when `qualifier` is a default-constructed handle.
    CIMProperty& addQualifier(CIMQualifier qualifier);
    using CIMConstProperty::getQualifier;
    CIMQualifier getQualifier(Uint32 index);

  private:
    friend class CIMConstProperty;
};

}  // namespace Pegasus
