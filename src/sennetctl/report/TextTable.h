#pragma once

// A table for people: columns as wide as their widest cell, up to a limit.

#include <cstddef>
#include <string>
#include <vector>

#include "report/Output.h"

namespace sennetctl {

class TextTable {
  public:
    /// A cell that is longer than the limit is shortened; 0 is no limit.
    explicit TextTable(std::vector<std::string> theTitles, std::size_t theCellLimit = 0);

    /// Cells may hold anything; the missing ones of a short row are empty.
    void addRow(std::vector<std::string> cells);

    /// Titles, in bold where there are colours, and rows; no line ends in blanks.
    void print(const Output& output) const;

  private:
    std::string fitting(const std::string& cell) const;
    std::string line(const std::vector<std::string>& cells) const;

    std::size_t cellLimit;
    std::vector<std::string> titles;
    std::vector<std::vector<std::string>> rows;
    std::vector<std::size_t> widths;
};

}  // namespace sennetctl
