#include "providers/InstanceBuilder.h"

#include "text/CimText.h"
#include "text/Utf8.h"

namespace cimomd {

using Pegasus::CIMValue;

InstanceBuilder::InstanceBuilder(const char* className) : instance(Pegasus::CIMName(className)) {}

InstanceBuilder& InstanceBuilder::text(const char* name, const std::optional<std::string>& value,
                                       std::size_t maxLength) {
    if (!value)
        return add(name, CIMValue(Pegasus::CIMTYPE_STRING, false));
    const std::string clean = cleanText(*value);
    return add(name, CIMValue(cimString(maxLength == 0 ? std::string_view(clean)
                                                       : firstCharacters(clean, maxLength))));
}

InstanceBuilder& InstanceBuilder::texts(const char* name, const std::vector<std::string>& values) {
    Pegasus::Array<Pegasus::String> array;
    for (const std::string& value : values)
        array.append(cimString(cleanText(value)));
    return add(name, CIMValue(array));
}

InstanceBuilder& InstanceBuilder::add(const char* name, const CIMValue& value) {
    instance.addProperty(Pegasus::CIMProperty(Pegasus::CIMName(name), value));
    return *this;
}

}  // namespace cimomd
