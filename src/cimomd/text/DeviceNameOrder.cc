#include "text/DeviceNameOrder.h"

#include <algorithm>

namespace cimomd {
namespace {

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

/// Takes the digits, or the other characters, from the front of `name`.
std::string_view takeRun(std::string_view& name) {
    const bool ofDigits = isDigit(name.front());
    const auto end = std::find_if(name.begin(), name.end(),
                                  [ofDigits](char c) { return isDigit(c) != ofDigits; });
    const std::string_view run = name.substr(0, static_cast<std::size_t>(end - name.begin()));
    name.remove_prefix(run.size());
    return run;
}

std::string_view withoutLeadingZeros(std::string_view run) {
    return run.substr(std::min(run.find_first_not_of('0'), run.size()));
}

int compareRuns(std::string_view a, std::string_view b) {
    if (isDigit(a.front()) && isDigit(b.front())) {
        a = withoutLeadingZeros(a);
        b = withoutLeadingZeros(b);
    }
    if (a.size() != b.size())
        return a.size() < b.size() ? -1 : 1;
    return a.compare(b);
}

}  // namespace

bool deviceNameLess(std::string_view a, std::string_view b) {
    std::string_view restOfA = a;
    std::string_view restOfB = b;
    while (!restOfA.empty() && !restOfB.empty()) {
        const int order = compareRuns(takeRun(restOfA), takeRun(restOfB));
        if (order != 0)
            return order < 0;
    }
    if (restOfA.empty() != restOfB.empty())
        return restOfA.empty();
    // Only leading zeros can tell them apart now.
    return a < b;
}

}  // namespace cimomd
