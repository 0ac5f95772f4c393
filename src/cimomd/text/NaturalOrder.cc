#include "text/NaturalOrder.h"

#include <algorithm>

namespace cimomd {
namespace {

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

/// Takes the number at the front of `text` away and gives it without leading zeros.
std::string_view takeNumber(std::string_view& text) {
    const auto end = std::find_if_not(text.begin(), text.end(), isDigit);
    std::string_view digits = text.substr(0, static_cast<std::size_t>(end - text.begin()));
    text.remove_prefix(digits.size());
    digits.remove_prefix(std::min(digits.find_first_not_of('0'), digits.size()));
    return digits;
}

/// Below, equal to or above 0, as `a` is below, equal to or above `b`.
int comparedNumbers(std::string_view a, std::string_view b) {
    if (a.size() != b.size())
        return a.size() < b.size() ? -1 : 1;
    return a.compare(b);
}

int comparedFronts(std::string_view& a, std::string_view& b) {
    if (isDigit(a.front()) && isDigit(b.front()))
        return comparedNumbers(takeNumber(a), takeNumber(b));
    const int difference =
        static_cast<unsigned char>(a.front()) - static_cast<unsigned char>(b.front());
    a.remove_prefix(1);
    b.remove_prefix(1);
    return difference;
}

}  // namespace

bool naturallyBefore(std::string_view a, std::string_view b) {
    std::string_view restOfA = a;
    std::string_view restOfB = b;
    while (!restOfA.empty() && !restOfB.empty()) {
        const int difference = comparedFronts(restOfA, restOfB);
        if (difference != 0)
            return difference < 0;
    }
    if (restOfA.empty() != restOfB.empty())
        return restOfA.empty();
    return a < b;
}

}  // namespace cimomd
