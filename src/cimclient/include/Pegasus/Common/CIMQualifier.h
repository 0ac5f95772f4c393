// A qualifier: a named, typed value that describes a class or a property (DSP0004).
#pragma once

#include <Pegasus/Common/BodyRef.h>
#include <Pegasus/Common/CIMFlavor.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMType.h>
#include <Pegasus/Common/CIMValue.h>

namespace Pegasus {

class CIMValue;
class QualifierBody;
class CIMQualifier;

/// A handle that reads. Copies share one qualifier. Getters of a default-constructed handle raise
/// UninitializedObjectException.
class CIMConstQualifier {
  public:
    CIMConstQualifier() = default;
    /// Raises UninitializedObjectException when `name` is null.
    CIMConstQualifier(const CIMName& name, const CIMValue& value,
                      const CIMFlavor& flavor = CIMFlavor(), Boolean propagated = false);

    const CIMName& getName() const;
    CIMType getType() const;
    Boolean isArray() const;
    const CIMValue& getValue() const;
    const CIMFlavor& getFlavor() const;
    /// Whether the qualifier was inherited and not declared here.
    Boolean getPropagated() const;

    Boolean isUninitialized() const { return !body; }
    CIMQualifier clone() const;

  protected:
    explicit CIMConstQualifier(QualifierBody* newBody);
    QualifierBody& access() const;

  private:
    BodyRef<QualifierBody> body;
};

/// The handle that also changes its qualifier.
class CIMQualifier : public CIMConstQualifier {
  public:
    CIMQualifier() = default;
    using CIMConstQualifier::CIMConstQualifier;

    void setValue(const CIMValue& value);
    void setFlavor(const CIMFlavor& flavor);
    void setPropagated(Boolean propagated);

  private:
    friend class CIMConstQualifier;
};

}  // namespace Pegasus
