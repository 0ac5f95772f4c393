// A property of a class or an instance: a name, a value and, in classes, qualifiers (DSP0004).
#pragma once

#include <Pegasus/Common/BodyRef.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMQualifier.h>
#include <Pegasus/Common/CIMType.h>
#include <Pegasus/Common/CIMValue.h>

namespace Pegasus {

class CIMValue;
class PackedProperties;
class PropertyBody;
class CIMProperty;

/// A handle that reads. Copies share one property. That of an instance which a server sent shows
/// the property as it was sent, also after the instance was changed. Getters of a
/// default-constructed handle raise UninitializedObjectException.
class CIMConstProperty {
  public:
    CIMConstProperty() = default;
    /// `arraySize` is the declared size of an array of fixed size, otherwise 0. `referenceClass`
    /// is that of a reference. `classOrigin` is the class that declared the property, `propagated`
    /// whether it was inherited. Raises UninitializedObjectException when `name` is null.
    CIMConstProperty(CIMName name, CIMValue value, Uint32 arraySize = 0,
                     CIMName referenceClass = CIMName(), CIMName classOrigin = CIMName(),
                     Boolean propagated = false);

    /// These are copies, which are cheap: there need be no object that they could refer to.
    CIMName getName() const;
    CIMValue getValue() const;
    CIMType getType() const;
    Boolean isArray() const;
    /// The declared size of an array of fixed size; 0 for any other property.
    Uint32 getArraySize() const;
    CIMName getReferenceClassName() const;
    CIMName getClassOrigin() const;
    Boolean getPropagated() const;

    /// The position of the qualifier, or PEG_NOT_FOUND.
    Uint32 findQualifier(const CIMName& name) const;
    /// Raises IndexOutOfBoundsException.
    CIMConstQualifier getQualifier(Uint32 position) const;
    Uint32 getQualifierCount() const;

    Boolean isUninitialized() const { return !body; }
    CIMProperty clone() const;

  protected:
    explicit CIMConstProperty(PropertyBody* newBody);
    PropertyBody& access() const;

  private:
    friend class PropertyStore;
    /// Property `index` of `properties`.
    CIMConstProperty(const BodyRef<PackedProperties>& properties, Uint32 index);
    const PackedProperties* packed() const;

    static constexpr Uint32 kNotPacked = PEG_NOT_FOUND;

    /// A PropertyBody or PackedProperties, of which it is one.
    BodyRef<SharedBody> body;
    Uint32 index = kNotPacked;
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
