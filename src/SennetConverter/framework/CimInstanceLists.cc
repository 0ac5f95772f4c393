#include "SennetConverter/framework/CimInstanceLists.h"

#include <algorithm>

namespace Pegasus {

void CimInstanceLists::addInstanceList(Array<CIMInstance>& instances) {
    if (instances.size() > 0) {
        lists.push_back(instances);
    }
}

int CimInstanceLists::getNumberOfInstanceLists() const {
    return static_cast<int>(lists.size());
}

Array<CIMInstance> CimInstanceLists::getInstanceList(int index) const {
    if (index < 0 || index >= getNumberOfInstanceLists()) {
        return Array<CIMInstance>();
    }
    return lists[static_cast<std::size_t>(index)];
}

Uint32 largestListSize(const CimInstanceLists& instanceLists) {
    Uint32 largest = 0;
    for (int i = 0; i < instanceLists.getNumberOfInstanceLists(); ++i) {
        largest = std::max(largest, instanceLists.getInstanceList(i).size());
    }
    return largest;
}

bool holdsData(const Array<CIMClass>& classes, const CimInstanceLists& instanceLists) {
    return classes.size() > 0 && largestListSize(instanceLists) > 0;
}

}  // namespace Pegasus
