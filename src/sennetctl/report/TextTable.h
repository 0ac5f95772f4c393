#pragma once

// A table for people: columns as wide as their widest cell, on a terminal as far as that has room.

#include <cstddef>
#include <string>
#include <vector>

#include "report/Output.h"

namespace sennetctl {

class TextTable {
  public:
    /// Whether long cells may be shortened so that the lines fit a terminal.
    enum class Cells { Whole, Fitting };

    explicit TextTable(std::vector<std::string> theTitles, Cells theCells = Cells::Whole);

    /// Cells may hold anything; the missing ones of a short row are empty.
    void addRow(std::vector<std::string> row);

    /// Titles, in bold where there are colours, and rows; no line ends in blanks. Titles are never
    /// shortened, and cells not to less than 16 characters. Where that would fill more than 64 MiB,
    /// for one long cell among many rows, the cells stand whole and two blanks apart.
    void print(const Output& output) const;

  private:
    using Widths = std::vector<std::size_t>;

    std::size_t cellLimitFor(std::size_t lineWidth) const;
    Widths widthsWithin(std::size_t cellLimit) const;

    Cells cells;
    std::vector<std::string> titles;
    std::vector<std::vector<std::string>> rows;
    Widths widestCells;
};

}  // namespace sennetctl
