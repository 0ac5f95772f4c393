#pragma once

// Tells the rows of one group apart by their keys.

#include <optional>
#include <set>
#include <string>
#include <vector>

#include "mifreader/Document.h"

namespace sennetctl {

class RowKeys {
  public:
    explicit RowKeys(const Mif::Group& group);

    /// Whether an earlier row of the group had this row's key. The time grows with what the row
    /// itself says, however much the group adds to it.
    bool isRepeated(const Mif::Row& row);

  private:
    struct Place {
        bool isKey = false;
        std::optional<std::string> usual;  // what a row has that leaves its value out
    };

    std::vector<Place> places;
    std::set<std::string> keys;
};

}  // namespace sennetctl
