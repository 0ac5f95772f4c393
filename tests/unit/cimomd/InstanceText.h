#pragma once

// Looking into instances: properties as text.

#include <Pegasus/Common/CIMInstance.h>

#include <memory>
#include <string>
#include <vector>

#include "providers/InstanceStream.h"
#include "text/CimText.h"

namespace cimomd {

/// The value's text, "null" for null and "no property" when there is none.
inline std::string textOf(const Pegasus::CIMConstInstance& instance, const char* property) {
    const Pegasus::Uint32 index = instance.findProperty(property);
    if (index == Pegasus::PEG_NOT_FOUND)
        return "no property";
    const Pegasus::CIMValue& value = instance.getProperty(index).getValue();
    return value.isNull() ? "null" : utf8Of(value.toString());
}

inline std::vector<Pegasus::CIMInstance> all(std::unique_ptr<InstanceStream> stream) {
    std::vector<Pegasus::CIMInstance> instances;
    ProvidedInstance provided;
    while (stream->next(provided))
        instances.push_back(provided.instance);
    return instances;
}

}  // namespace cimomd
