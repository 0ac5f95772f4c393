// Reads the elements of DSP0201 that name things: namespaces, classes and instances.

#pragma once

#include <Pegasus/Common/CIMKeyBinding.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMObjectPath.h>

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "xml/DecodeContext.h"
#include "xml/ElementReader.h"
#include "xml/MarkupRun.h"

namespace Pegasus {

/// Each function reads the element that it is named after, which the reader has just entered.
/// Failures are XmlError.
class PathReader {
  public:
    /// A key as it looked in an earlier instance name.
    struct KnownKey {
        CIMName name;
        CIMKeyBinding::Type type;
        MarkupRun markup;
        /// The latest value as it was read, if one was, and as a string, for many are alike.
        std::optional<std::string> latestText;
        String latestValue;
    };

    /// All must outlive the path reader. With `known`, which is for the reader to fill, keys that
    /// look alike are recognised.
    PathReader(ElementReader& reader, DecodeContext& context,
               std::vector<KnownKey>* known = nullptr)
        : reader(reader), context(context), known(known) {}

    /// LOCALNAMESPACEPATH: its NAMESPACE elements joined by "/".
    CIMNamespaceName readLocalNamespacePath();
    /// CLASSNAME.
    CIMName readClassName();
    /// INSTANCENAME: a path of class name and keys. One key without a name, which the grammar
    /// allows, gets a null name. Keys may be references of up to 65,536 characters, whose keys may
    /// be such again, four inside each other.
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
    String readReferenceKey();
    CIMKeyBinding readKeyValue(const CIMName& name);
    CIMKeyBinding makeKey(const CIMName& name, CIMKeyBinding::Type type,
                          const ElementText& text) const;
    bool readKnownKey(Array<CIMKeyBinding>& keys);
    bool readNextKey(Array<CIMKeyBinding>& keys);
    void learn(const CIMKeyBinding& key, Uint32 position, std::string_view element);

    ElementReader& reader;
    DecodeContext& context;
    std::vector<KnownKey>* known;
    /// Of keys, inside each other, at this place.
    unsigned references = 0;
};

}  // namespace Pegasus
