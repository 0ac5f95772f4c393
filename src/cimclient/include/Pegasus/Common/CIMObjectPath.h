// The path of a class or an instance: where it is and what identifies it there (DSP0004, "Object
// naming").
#pragma once

#include <Pegasus/Common/Array.h>
#include <Pegasus/Common/BodyRef.h>
#include <Pegasus/Common/CIMKeyBinding.h>
#include <Pegasus/Common/CIMName.h>

namespace Pegasus {

class ObjectPathBody;

/// A handle: copies share one path, and a change through one is seen through all of them.
class CIMObjectPath {
  public:
    /// An empty path.
    CIMObjectPath();
    /// `host` may be empty, `nameSpace` and `className` null. Raises MalformedObjectNameException
    /// for a host that setHost() would refuse.
    CIMObjectPath(const String& host, CIMNamespaceName nameSpace, CIMName className,
                  Array<CIMKeyBinding> keyBindings = Array<CIMKeyBinding>());
    /// Reads [//host/][namespace:]Class[.key=value,key=value]. A value in quotes is read as a
    /// string, also when it is the text of a path; the empty text is the empty path. Raises
    /// MalformedObjectNameException.
    CIMObjectPath(const String& text);
    CIMObjectPath(const char* text);

    const String& getHost() const;
    /// Raises MalformedObjectNameException when `host` has a "/", a blank or a control character.
    void setHost(const String& host);
    const CIMNamespaceName& getNameSpace() const;
    void setNameSpace(const CIMNamespaceName& nameSpace);
    const CIMName& getClassName() const;
    void setClassName(const CIMName& className);
    /// In the order they were given in.
    const Array<CIMKeyBinding>& getKeyBindings() const;
    void setKeyBindings(const Array<CIMKeyBinding>& keyBindings);

    /// [//host/][namespace:]Class.key=value,key=value with the keys sorted by name.
    String toString() const;

    /// Whether both name one object: names and host ignore case, keys come in any order.
    Boolean identical(const CIMObjectPath& other) const;
    CIMObjectPath clone() const;

  private:
    BodyRef<ObjectPathBody> body;
};

inline Boolean operator==(const CIMObjectPath& a, const CIMObjectPath& b) {
    return a.identical(b);
}

}  // namespace Pegasus
