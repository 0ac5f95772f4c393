#include "report/TextTable.h"

#include <algorithm>
#include <numeric>
#include <ostream>
#include <utility>

#include "report/Text.h"

namespace sennetctl {

namespace {

constexpr std::size_t kGap = 2;
constexpr std::size_t kNarrowestCell = 16;
constexpr std::size_t kMostAlignedOctets = std::size_t(64) << 20;

std::string line(const std::vector<std::string>& cells, const std::vector<std::size_t>& widths) {
    std::string text;
    for (std::size_t i = 0; i < cells.size(); ++i) {
        const std::string cell = shortened(cells[i], widths[i]);
        text += cell;
        const std::size_t width = widthOf(cell);
        text.append(std::max(widths[i], width) - width + kGap, ' ');
    }
    text.erase(text.find_last_not_of(' ') + 1);
    return text;
}

std::size_t lineWidthOf(const std::vector<std::size_t>& widths) {
    const std::size_t gaps = widths.empty() ? 0 : (widths.size() - 1) * kGap;
    return std::accumulate(widths.begin(), widths.end(), gaps);
}

}  // namespace

TextTable::TextTable(std::vector<std::string> theTitles, Cells theCells) : cells(theCells) {
    for (const std::string& title : theTitles) {
        titles.push_back(printable(title));
    }
    widestCells.resize(titles.size());
}

void TextTable::addRow(std::vector<std::string> row) {
    row.resize(titles.size());
    for (std::size_t i = 0; i < row.size(); ++i) {
        row[i] = printable(row[i]);
        widestCells[i] = std::max(widestCells[i], widthOf(row[i]));
    }
    rows.push_back(std::move(row));
}

void TextTable::print(const Output& output) const {
    const bool fitting = cells == Cells::Fitting && output.width > 0;
    Widths widths = widthsWithin(fitting ? cellLimitFor(output.width) : std::string::npos);
    if (lineWidthOf(widths) > kMostAlignedOctets / (rows.size() + 1)) {
        widths.assign(widths.size(), 0);
    }
    const std::string head = line(titles, widths);
    output.out << (output.colour ? "\x1B[1m" + head + "\x1B[0m" : head) << '\n';
    for (const std::vector<std::string>& row : rows) {
        output.out << line(row, widths) << '\n';
    }
}

/// The most characters that the cells may have, so that a line is no wider.
std::size_t TextTable::cellLimitFor(std::size_t lineWidth) const {
    const auto fits = [&](std::size_t limit) {
        return lineWidthOf(widthsWithin(limit)) <= lineWidth;
    };
    std::size_t limit = std::max(lineWidth, kNarrowestCell);
    while (limit > kNarrowestCell && !fits(limit)) {
        --limit;
    }
    return limit;
}

TextTable::Widths TextTable::widthsWithin(std::size_t cellLimit) const {
    Widths widths;
    for (std::size_t i = 0; i < titles.size(); ++i) {
        widths.push_back(std::max(widthOf(titles[i]), std::min(widestCells[i], cellLimit)));
    }
    return widths;
}

}  // namespace sennetctl
