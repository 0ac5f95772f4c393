#include "SennetConverter/mif/LdmsSennetConverter.h"

namespace Pegasus {

String LdmsSennetConverter::getTypeString(CIMClass cimClass, String propertyName, CIMType type) {
    if (isInteger(type)) {
        return stringType(getMaxLength(cimClass, propertyName));
    }
    return SennetConverter::getTypeString(cimClass, propertyName, type);
}

}  // namespace Pegasus
