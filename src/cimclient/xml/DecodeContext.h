// What the readers of one message share: the names made so far, and what is being read, so that a
// fault can be reported with the class and the property it was found in.

#pragma once

#include <Pegasus/Common/CIMName.h>

#include <string>
#include <string_view>

#include "xml/ElementReader.h"
#include "xml/NameCache.h"

namespace Pegasus {

struct DecodeContext {
    explicit DecodeContext(NameCache& names, unsigned embeddingLevel = 0)
        : names(names), embeddingLevel(embeddingLevel) {}

    /// The name in an attribute of the element that `reader` has just entered. Fails when there is
    /// no such attribute, or its value is no CIM name. Valid as long as `names`.
    const CIMName& requiredName(const ElementReader& reader, std::string_view attributeName);

    /// As requiredName, but null when the attribute is missing.
    CIMName optionalName(const ElementReader& reader, std::string_view attributeName);

    /// For the end of a message: `; in property P of class C`, or nothing outside of objects.
    std::string place() const;

    NameCache& names;
    /// How many embedded objects the text being read is inside of.
    unsigned embeddingLevel;
    /// Null while no class or instance, or none of its properties, is being read.
    const CIMName* className = nullptr;
    const CIMName* propertyName = nullptr;
};

}  // namespace Pegasus
