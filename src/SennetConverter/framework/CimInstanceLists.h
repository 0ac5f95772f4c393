#pragma once

#include <Pegasus/Client/CIMClient.h>

#include <vector>

namespace Pegasus {

/// The instances of one script's classes: one list per class that returned any. A class without
/// instances leaves no gap, so list k belongs to the k-th class that has some.
class CimInstanceLists {
  public:
    /// Appends a list (the body is shared, not copied); an empty one is not added.
    void addInstanceList(Array<CIMInstance>& instances);

    int getNumberOfInstanceLists() const;

    /// List at index; empty when there is none.
    Array<CIMInstance> getInstanceList(int index) const;

  private:
    std::vector<Array<CIMInstance>> lists;
};

/// Number of instances in the longest list; 0 when there is no list.
Uint32 largestListSize(const CimInstanceLists& instanceLists);

/// True when there is a class and some list holds an instance.
bool holdsData(const Array<CIMClass>& classes, const CimInstanceLists& instanceLists);

}  // namespace Pegasus
