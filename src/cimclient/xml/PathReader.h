// Reads the elements of DSP0201 that name things: namespaces, classes and instances.

#pragma once

#include <Pegasus/Common/CIMKeyBinding.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMObjectPath.h>

#include "xml/DecodeContext.h"
#include "xml/ElementReader.h"

namespace Pegasus {

/// Each function reads the element that it is named after, which the reader has just entered.
/// Failures are XmlError.
class PathReader {
  public:
    /// Both must outlive the path reader.
    PathReader(ElementReader& reader, DecodeContext& context) : reader(reader), context(context) {}

    /// LOCALNAMESPACEPATH: its NAMESPACE elements joined by "/".
    CIMNamespaceName readLocalNamespacePath();
    /// CLASSNAME.
    CIMName readClassName();
    /// INSTANCENAME: a path of class name and keys. One key without a name, which the grammar
    /// allows, gets a null name.
    CIMObjectPath readInstanceName();
    /// VALUE.REFERENCE, with any of the six kinds of path in it.
    CIMObjectPath readReference();
    /// LOCALINSTANCEPATH.
    CIMObjectPath readLocalInstancePath();
    /// LOCALCLASSPATH.
    CIMObjectPath readLocalClassPath();

  private:
    CIMObjectPath readAnyPath();
    CIMObjectPath readInstancePath();
    CIMObjectPath readClassPath();
    void readNamespacePath(CIMObjectPath& path);
    void readHost(CIMObjectPath& path);
    CIMKeyBinding readKeyBinding();
    CIMKeyBinding readKey(const CIMName& name);
    CIMKeyBinding readKeyValue(const CIMName& name);

    ElementReader& reader;
    DecodeContext& context;
};

}  // namespace Pegasus
