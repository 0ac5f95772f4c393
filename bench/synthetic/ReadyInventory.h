// Every answer that a synthetic inventory needs.

#pragma once

#include <cstddef>
#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "bench/synthetic/ReadyAnswer.h"
#include "bench/synthetic/SyntheticClass.h"

namespace bench {

/// How large an inventory is.
struct InventorySize {
    std::size_t classes;
    /// Of each class.
    std::size_t properties;
    /// Of each class.
    std::size_t instances;
};

class ReadyInventory {
  public:
    /// The same size gives the same inventory.
    explicit ReadyInventory(const InventorySize& size);

    const std::vector<SyntheticClass>& classes() const { return classList; }
    /// nullptr when there is no such answer.
    const ReadyAnswer* find(std::string_view method, std::string_view className) const;

  private:
    std::vector<SyntheticClass> classList;
    std::map<std::string, ReadyAnswer, std::less<>> answers;
};

}  // namespace bench
