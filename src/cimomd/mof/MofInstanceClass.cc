#include "mof/MofInstanceClass.h"

#include "repository/QualifierInheritance.h"

namespace cimomd {
namespace {

using Pegasus::CIMConstProperty;
using Pegasus::CIMName;
using Pegasus::CIMProperty;
using Pegasus::CIMValue;

bool isKey(const CIMConstProperty& property) {
    static const CIMName kKey("Key");
    const Pegasus::Uint32 position = property.findQualifier(kKey);
    return position != Pegasus::PEG_NOT_FOUND && isTrue(property.getQualifier(position));
}

}  // namespace

MofInstanceClass::MofInstanceClass(const Pegasus::CIMConstClass& cimClass) {
    for (Pegasus::Uint32 i = 0; i < cimClass.getPropertyCount(); ++i) {
        const CIMConstProperty property = cimClass.getProperty(i);
        if (isKey(property))
            keyPositions.push_back(i);
        positions.emplace(property.getName(), i);
        properties.push_back(withValue(property, property.getValue()));
    }
}

std::optional<std::size_t> MofInstanceClass::find(const CIMName& property) const {
    const auto place = positions.find(property);
    return place == positions.end() ? std::nullopt : std::optional(place->second);
}

CIMProperty withValue(const CIMConstProperty& original, const CIMValue& value) {
    return CIMProperty(original.getName(), value, original.getArraySize(),
                       original.getReferenceClassName(), original.getClassOrigin(),
                       original.getPropagated());
}

}  // namespace cimomd
