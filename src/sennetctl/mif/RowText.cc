#include "mif/RowText.h"

#include <algorithm>

namespace sennetctl {

void RowText::add(std::size_t column, std::string_view text) {
    values.emplace_back(column, text);
}

std::string RowText::joined(std::size_t columns) const {
    if (values.empty()) {
        return {};
    }
    std::string text;
    std::size_t last = values.front().first;
    const auto advanceTo = [&](std::size_t column) {
        for (; last < column; ++last) {
            text += ", ";
        }
    };
    for (const auto& [column, value] : values) {
        advanceTo(column);
        text += value;
    }
    advanceTo(columns - 1);
    return text;
}

bool operator<(const RowText& one, const RowText& other) {
    const auto [mine, theirs] = std::mismatch(one.values.begin(), one.values.end(),
                                              other.values.begin(), other.values.end());
    if (mine == one.values.end() || theirs == other.values.end()) {
        return theirs != other.values.end();
    }
    // Whose value is of a later column has none in the earlier one.
    return mine->first == theirs->first ? mine->second < theirs->second
                                        : mine->first > theirs->first;
}

}  // namespace sennetctl
