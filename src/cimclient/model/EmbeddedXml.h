// The CIM-XML elements (DSP0201) of the classes and instances that are embedded in values.
#pragma once

#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMObject.h>
#include <Pegasus/Common/CIMValue.h>

namespace Pegasus {

/// Writes elements without white space between them to the end of a string.
class EmbeddedXml {
  public:
    /// `out` is held by reference and must outlive this object.
    explicit EmbeddedXml(String& out) : out(out) {}

    /// CLASS or INSTANCE. Raise UninitializedObjectException for a handle on nothing.
    void append(const CIMObject& object);
    void append(const CIMClass& cimClass);
    void append(const CIMInstance& instance);

  private:
    class ValueElements;

    void appendQualifier(const CIMConstQualifier& qualifier);
    void appendProperty(const CIMConstProperty& property);
    void appendPropertyAttributes(const CIMConstProperty& property);
    template <class Owner>
    void appendQualifiers(const Owner& owner);
    template <class Owner>
    void appendProperties(const Owner& owner);

    void appendReference(const CIMObjectPath& path);
    void appendNamespacePath(const CIMObjectPath& path);
    void appendObjectName(const CIMObjectPath& path);
    void appendKey(const CIMKeyBinding& key);

    void appendAttribute(const char* name, const String& value);
    void appendEscaped(const String& text);
    void beginElement(const char* name) { out.append('<').append(name); }
    void endElement(const char* name) { out.append("</").append(name).append('>'); }

    String& out;
};

}  // namespace Pegasus
