// Reads the elements of DSP0201 that declare classes and instances.

#pragma once

#include <Pegasus/Common/Array.h>
#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMProperty.h>
#include <Pegasus/Common/CIMQualifier.h>

#include <string_view>

#include "xml/DecodeContext.h"
#include "xml/ElementReader.h"
#include "xml/InstanceAssembly.h"
#include "xml/PathReader.h"
#include "xml/ValueReader.h"

namespace Pegasus {

/// Each function reads the element that it is named after, which the reader has just entered.
/// Failures are XmlError; the context then says in which class and property.
class ObjectReader {
  public:
    /// Both must outlive the object reader.
    ObjectReader(ElementReader& reader, DecodeContext& context)
        : reader(reader),
          context(context),
          values(reader, context),
          paths(reader, context, &knownKeys) {}

    /// VALUE.NAMEDINSTANCE: an instance with its path.
    CIMInstance readNamedInstance();
    /// INSTANCE.
    CIMInstance readInstance();
    /// CLASS. Its methods are checked and left out.
    CIMClass readClass();

  private:
    bool readKnownProperty();
    bool readMember();
    CIMProperty readAnyProperty();
    bool isAtProperty() const;
    template <typename Item, typename Add>
    void addOnce(const char* kind, const Item& item, Add add) const;

    CIMProperty readProperty();
    CIMProperty readPropertyArray();
    CIMProperty readPropertyReference();
    CIMProperty readPropertyReferenceArray();
    CIMProperty readPropertyBody(CIMValue value, std::string_view valueElement);
    Uint32 readArraySize() const;
    CIMQualifier readQualifier();
    void skipMethod();
    void skipParameter();

    ElementReader& reader;
    DecodeContext& context;
    ValueReader values;
    std::vector<PathReader::KnownKey> knownKeys;
    PathReader paths;
    InstanceAssembly assembly;
};

}  // namespace Pegasus
