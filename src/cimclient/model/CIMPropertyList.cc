#include <Pegasus/Common/CIMPropertyList.h>

#include <utility>

namespace Pegasus {

CIMPropertyList::CIMPropertyList(Array<CIMName> propertyNames)
    : names(std::move(propertyNames)), null(false) {}

void CIMPropertyList::set(Array<CIMName> propertyNames) {
    *this = CIMPropertyList(std::move(propertyNames));
}

void CIMPropertyList::clear() {
    *this = CIMPropertyList();
}

}  // namespace Pegasus
