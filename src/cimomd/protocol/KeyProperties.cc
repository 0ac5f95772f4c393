#include "protocol/KeyProperties.h"

namespace cimomd {
namespace {

using Pegasus::Uint32;

bool isKey(const Pegasus::CIMConstProperty& property) {
    const Uint32 index = property.findQualifier("Key");
    Pegasus::Boolean key = false;
    if (index != Pegasus::PEG_NOT_FOUND)
        property.getQualifier(index).getValue().get(key);
    return key;
}

}  // namespace

std::vector<Pegasus::CIMName> keyPropertiesOf(const Pegasus::CIMConstClass& cimClass) {
    std::vector<Pegasus::CIMName> keys;
    for (Uint32 i = 0; i < cimClass.getPropertyCount(); ++i) {
        if (isKey(cimClass.getProperty(i)))
            keys.push_back(cimClass.getProperty(i).getName());
    }
    return keys;
}

}  // namespace cimomd
