#include "mof/MofNumber.h"

#include <charconv>

namespace cimomd {
namespace {

bool parseMagnitude(std::string_view digits, int base, std::uint64_t& value) {
    if (digits.empty())
        return false;
    const char* end = digits.data() + digits.size();
    const auto [stop, error] = std::from_chars(digits.data(), end, value, base);
    return error == std::errc() && stop == end;
}

bool isBinary(std::string_view digits) {
    if (digits.size() < 2 || (digits.back() != 'b' && digits.back() != 'B'))
        return false;
    return digits.find_first_not_of("01") == digits.size() - 1;
}

bool parseInteger(std::string_view digits, std::uint64_t& value) {
    if (digits.size() > 2 && digits[0] == '0' && (digits[1] == 'x' || digits[1] == 'X'))
        return parseMagnitude(digits.substr(2), 16, value);
    if (isBinary(digits))
        return parseMagnitude(digits.substr(0, digits.size() - 1), 2, value);
    if (digits.size() > 1 && digits[0] == '0')
        return parseMagnitude(digits, 8, value);
    return parseMagnitude(digits, 10, value);
}

bool parseReal(std::string_view digits, double& value) {
    const std::size_t point = digits.find('.');
    if (point + 1 >= digits.size() || digits[point + 1] < '0' || digits[point + 1] > '9')
        return false;
    const char* end = digits.data() + digits.size();
    const auto [stop, error] = std::from_chars(digits.data(), end, value);
    return error == std::errc() && stop == end;
}

}  // namespace

bool parseMofNumber(MofToken& token) {
    std::string_view digits = token.text;
    token.negative = digits.front() == '-';
    if (token.negative || digits.front() == '+')
        digits.remove_prefix(1);
    if (digits.find('.') == std::string_view::npos) {
        token.kind = MofTokenKind::Integer;
        return parseInteger(digits, token.magnitude);
    }
    token.kind = MofTokenKind::Real;
    if (!parseReal(digits, token.real))
        return false;
    if (token.negative)
        token.real = -token.real;
    return true;
}

}  // namespace cimomd
