// A class declaration: a name, a superclass, qualifiers and properties (DSP0004).
#pragma once

#include <Pegasus/Common/BodyRef.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMProperty.h>
#include <Pegasus/Common/CIMQualifier.h>

namespace Pegasus {

class ClassBody;
class CIMClass;
class CIMObject;

/// A handle that reads. Copies share one class. Getters of a default-constructed handle raise
/// UninitializedObjectException; positions that do not exist raise IndexOutOfBoundsException.
class CIMConstClass {
  public:
    CIMConstClass() = default;
    /// Raises UninitializedObjectException when `className` is null.
    explicit CIMConstClass(const CIMName& className, const CIMName& superClassName = CIMName());
    /// The class in `object`. Raises TypeMismatchException when it holds an instance.
    explicit CIMConstClass(const CIMObject& object);

    const CIMName& getClassName() const;
    /// Null for a class without a superclass.
    const CIMName& getSuperClassName() const;
    /// Whether the class is qualified as an association (as abstract).
    Boolean isAssociation() const;
    Boolean isAbstract() const;

    /// The position of the qualifier (property), or PEG_NOT_FOUND. Case is ignored.
    Uint32 findQualifier(const CIMName& name) const;
    CIMConstQualifier getQualifier(Uint32 index) const;
    Uint32 getQualifierCount() const;
    Uint32 findProperty(const CIMName& name) const;
    CIMConstProperty getProperty(Uint32 index) const;
    Uint32 getPropertyCount() const;

    Boolean isUninitialized() const { return !body; }
    CIMClass clone() const;

  protected:
    explicit CIMConstClass(ClassBody* newBody);
    ClassBody& access() const;

  private:
    friend class CIMObject;
    BodyRef<ClassBody> body;
};

/// The handle that also changes its class.
class CIMClass : public CIMConstClass {
  public:
    CIMClass() = default;
    using CIMConstClass::CIMConstClass;

    void setSuperClassName(const CIMName& name);

    /// Share what is added. Raise AlreadyExistsException when there is one of this name, and
    /// UninitializedObjectException when the argument is a default-constructed handle.
    CIMClass& addQualifier(CIMQualifier qualifier);
    CIMClass& addProperty(CIMProperty property);
    using CIMConstClass::getProperty;
    using CIMConstClass::getQualifier;
    CIMQualifier getQualifier(Uint32 index);
    CIMProperty getProperty(Uint32 index);

  private:
    friend class CIMConstClass;
};

}  // namespace Pegasus
