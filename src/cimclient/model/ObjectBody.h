// What classes and instances have in common: a class name, qualifiers and properties.
#pragma once

#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMProperty.h>
#include <Pegasus/Common/CIMQualifier.h>
#include <Pegasus/Common/SharedBody.h>

#include <memory>
#include <utility>

#include "NamedList.h"
#include "PropertyStore.h"

namespace Pegasus {

class ObjectBody : public SharedBody {
  public:
    explicit ObjectBody(CIMName className) : className(std::move(className)) {}

    virtual Boolean isClass() const = 0;
    /// A copy that shares nothing with this one.
    virtual std::unique_ptr<ObjectBody> clone() const = 0;

    void addQualifier(CIMQualifier qualifier) {
        qualifiers.add(std::move(qualifier), "qualifier", className);
    }
    void addProperty(CIMProperty property) { properties.add(std::move(property), className); }

    CIMName className;
    NamedList<CIMQualifier> qualifiers;
    PropertyStore properties;

  protected:
    /// Copies deeply, unlike the handles' own copies.
    ObjectBody(const ObjectBody& other)
        : SharedBody(other),
          className(other.className),
          qualifiers(other.qualifiers.clone()),
          properties(other.properties.clone()) {}
};

}  // namespace Pegasus
