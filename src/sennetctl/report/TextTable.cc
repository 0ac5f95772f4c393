#include "report/TextTable.h"

#include <algorithm>
#include <ostream>
#include <utility>

#include "report/Text.h"

namespace sennetctl {

TextTable::TextTable(std::vector<std::string> theTitles, std::size_t theCellLimit)
    : cellLimit(theCellLimit) {
    for (const std::string& title : theTitles) {
        titles.push_back(printable(title));
        widths.push_back(widthOf(titles.back()));
    }
}

void TextTable::addRow(std::vector<std::string> cells) {
    cells.resize(titles.size());
    for (std::size_t i = 0; i < cells.size(); ++i) {
        cells[i] = fitting(cells[i]);
        widths[i] = std::max(widths[i], widthOf(cells[i]));
    }
    rows.push_back(std::move(cells));
}

void TextTable::print(const Output& output) const {
    const std::string head = line(titles);
    output.out << (output.colour ? "\x1B[1m" + head + "\x1B[0m" : head) << '\n';
    for (const std::vector<std::string>& row : rows) {
        output.out << line(row) << '\n';
    }
}

std::string TextTable::fitting(const std::string& cell) const {
    return shortened(printable(cell), cellLimit);
}

std::string TextTable::line(const std::vector<std::string>& cells) const {
    std::string text;
    for (std::size_t i = 0; i < cells.size(); ++i) {
        text += cells[i];
        text.append(widths[i] - widthOf(cells[i]) + 2, ' ');
    }
    text.erase(text.find_last_not_of(' ') + 1);
    return text;
}

}  // namespace sennetctl
