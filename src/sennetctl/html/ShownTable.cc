#include "html/ShownTable.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <utility>

#include "SennetConverter/mif/SennetConverter.h"

namespace sennetctl {

namespace {

using Values = std::vector<Mif::Value>;

/// Products differ in whether row numbers are integers or padded texts.
std::uint64_t rowNumber(const Mif::Value& value) {
    return value.kind == Mif::Value::Kind::Integer ? value.magnitude
                                                   : std::strtoull(value.text.c_str(), nullptr, 10);
}

std::vector<const Values*> orderedRows(const MifTable& table) {
    const auto numbers = std::find_if(table.columns.begin(), table.columns.end(), isRowNumber);
    const auto place = static_cast<std::size_t>(numbers - table.columns.begin());
    std::vector<std::pair<std::uint64_t, const Values*>> numbered;
    numbered.reserve(table.rows.size());
    for (const Values& row : table.rows) {
        numbered.emplace_back(place < row.size() ? rowNumber(row[place]) : 0, &row);
    }
    std::stable_sort(numbered.begin(), numbered.end(),
                     [](const auto& one, const auto& other) { return one.first < other.first; });
    std::vector<const Values*> rows;
    rows.reserve(numbered.size());
    for (const auto& [number, row] : numbered) {
        rows.push_back(row);
    }
    return rows;
}

/// The value for people; empty for those that stand for none.
std::string textOf(const Mif::Value& value, const MifColumn& column) {
    std::string text = shownValue(value, column);
    const bool isDate = column.type.base == Mif::Type::Base::Date;
    const bool none = text.find_first_not_of(' ') == std::string::npos ||
                      (isDate && text == Pegasus::SennetConverter::kUnknownDate);
    return none ? std::string() : text;
}

/// A heading or a link without any text leads nobody anywhere.
std::string nameOrWord(const std::string& name) {
    return name.find_first_not_of(' ') == std::string::npos ? "(without a name)" : name;
}

/// Some products have all numbers in texts. What begins with a zero is a name made of digits.
bool isNumber(const std::string& text) {
    constexpr std::size_t kMostDigits = 20;
    const std::string digits = text.substr(text.rfind('-', 0) == 0 ? 1 : 0);
    return !digits.empty() && digits.size() <= kMostDigits &&
           digits.find_first_not_of("0123456789") == std::string::npos &&
           (digits[0] != '0' || text == "0");
}

}  // namespace

ShownTable shownTable(const MifTable& table) {
    const std::vector<const Values*> rows = orderedRows(table);
    ShownTable shown{nameOrWord(table.name), table.className, table.description, {}, {}, {}};
    shown.rows.resize(rows.size());
    for (std::size_t i = 0; i < table.columns.size(); ++i) {
        const MifColumn& column = table.columns[i];
        if (isRowNumber(column)) {
            continue;
        }
        std::vector<std::string> texts;
        texts.reserve(rows.size());
        for (const Values* row : rows) {
            texts.push_back(textOf((*row)[i], column));
        }
        const auto isEmpty = [](const std::string& text) { return text.empty(); };
        if (!rows.empty() && std::all_of(texts.begin(), texts.end(), isEmpty)) {
            shown.emptyColumns.push_back(nameOrWord(column.name));
            continue;
        }
        const bool numbers =
            !rows.empty() && std::all_of(texts.begin(), texts.end(), [](const std::string& text) {
                return text.empty() || isNumber(text);
            });
        shown.columns.push_back({nameOrWord(column.name), column.description, numbers});
        for (std::size_t k = 0; k < rows.size(); ++k) {
            shown.rows[k].push_back(std::move(texts[k]));
        }
    }
    return shown;
}

}  // namespace sennetctl
