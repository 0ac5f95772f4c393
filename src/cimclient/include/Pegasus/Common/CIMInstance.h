// An instance of a class: its property values and, when known, its path (DSP0004).
#pragma once

#include <Pegasus/Common/BodyRef.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMObjectPath.h>

#include <memory>

namespace Pegasus {

class InstanceBody;
class InstanceWriter;
class PropertyOrigins;
class CIMInstance;
class CIMObject;
class CIMConstProperty;
class CIMProperty;
class CIMConstQualifier;
class CIMQualifier;
CIMInstance makeInstance(std::unique_ptr<InstanceBody> body);

/// A handle that reads. Copies share one instance. Getters of a default-constructed handle raise
/// UninitializedObjectException; positions that do not exist raise IndexOutOfBoundsException.
class CIMConstInstance {
  public:
    CIMConstInstance() = default;
    /// Raises UninitializedObjectException when `className` is null.
    explicit CIMConstInstance(const CIMName& className);
    /// The instance in `object`. Raises TypeMismatchException when it holds a class.
    explicit CIMConstInstance(const CIMObject& object);

    const CIMName& getClassName() const;
    /// Empty when no path was set.
    const CIMObjectPath& getPath() const;

    /// The position of the qualifier (property), or PEG_NOT_FOUND. Case is ignored.
    Uint32 findQualifier(const CIMName& name) const;
    CIMConstQualifier getQualifier(Uint32 index) const;
    Uint32 getQualifierCount() const;
    Uint32 findProperty(const CIMName& name) const;
    CIMConstProperty getProperty(Uint32 index) const;
    Uint32 getPropertyCount() const;

    Boolean isUninitialized() const { return !body; }
    CIMInstance clone() const;

  protected:
    explicit CIMConstInstance(InstanceBody* newBody);
    InstanceBody& access() const;

  private:
    friend class CIMObject;
    friend class InstanceWriter;
    friend class PropertyOrigins;
    BodyRef<InstanceBody> body;
};

/// The handle that also changes its instance.
class CIMInstance : public CIMConstInstance {
  public:
    CIMInstance() = default;
    using CIMConstInstance::CIMConstInstance;

    void setPath(CIMObjectPath path);

    /// Share what is added. Raise AlreadyExistsException when there is one of this name, and
    /// UninitializedObjectException when the argument is a default-constructed handle.
    CIMInstance& addQualifier(CIMQualifier qualifier);
    CIMInstance& addProperty(CIMProperty property);
    using CIMConstInstance::getProperty;
    using CIMConstInstance::getQualifier;
    CIMQualifier getQualifier(Uint32 index);
    CIMProperty getProperty(Uint32 index);

  private:
    friend class CIMConstInstance;
    friend CIMInstance makeInstance(std::unique_ptr<InstanceBody> body);
};

}  // namespace Pegasus

// Last, because a value can hold an instance: CIMValue.h, which this includes, needs the above.
#include <Pegasus/Common/CIMProperty.h>
