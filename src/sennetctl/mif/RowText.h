#pragma once

// Some of the values of a row, to compare it with others.

#include <cstddef>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace sennetctl {

/// One value of each column that is compared; a missing one is empty. Only values that are not are
/// held, so that a row of a table without most of the columns takes no room for them.
class RowText {
  public:
    /// The next value that is not empty, of a column behind those of the others. The text must
    /// outlive the object.
    void add(std::size_t column, std::string_view text);

    bool empty() const { return values.empty(); }

    /// The values of this many columns from the first that is not empty, with commas.
    std::string joined(std::size_t columns) const;

    /// In the order of the first values that differ.
    friend bool operator<(const RowText& one, const RowText& other);

  private:
    std::vector<std::pair<std::size_t, std::string_view>> values;
};

}  // namespace sennetctl
