#include "mof/MofNumber.h"

#include <charconv>

namespace cimomd {
namespace {

constexpr std::string_view kNumber = "a number";
constexpr std::string_view kOctal = "digits from 0 to 7 after the leading 0";
constexpr std::string_view kInteger = "a number within 64 bits";
constexpr std::string_view kReal = "a real number such as 1.5";
constexpr std::string_view kDouble = "a number within the range of real64";

/// What was expected, as of all functions below.
std::string_view parseMagnitude(std::string_view digits, int base, std::uint64_t& value,
                                std::string_view expected) {
    const char* end = digits.data() + digits.size();
    const auto [stop, error] = std::from_chars(digits.data(), end, value, base);
    if (error == std::errc::invalid_argument || stop != end)
        return expected;
    return error == std::errc() ? std::string_view() : kInteger;
}

bool isBinary(std::string_view digits) {
    if (digits.size() < 2 || (digits.back() != 'b' && digits.back() != 'B'))
        return false;
    return digits.find_first_not_of("01") == digits.size() - 1;
}

bool isOctal(std::string_view digits) {
    return digits.size() > 1 && digits.find_first_not_of("0123456789") == std::string_view::npos &&
           digits[0] == '0';
}

std::string_view parseInteger(std::string_view digits, std::uint64_t& value) {
    if (digits.size() > 2 && digits[0] == '0' && (digits[1] == 'x' || digits[1] == 'X'))
        return parseMagnitude(digits.substr(2), 16, value, kNumber);
    if (isBinary(digits))
        return parseMagnitude(digits.substr(0, digits.size() - 1), 2, value, kNumber);
    if (isOctal(digits))
        return parseMagnitude(digits, 8, value, kOctal);
    return parseMagnitude(digits, 10, value, kNumber);
}

std::string_view parseReal(std::string_view digits, double& value) {
    const std::size_t point = digits.find('.');
    if (point + 1 >= digits.size() || digits[point + 1] < '0' || digits[point + 1] > '9')
        return kReal;
    const char* end = digits.data() + digits.size();
    const auto [stop, error] = std::from_chars(digits.data(), end, value);
    if (error == std::errc::invalid_argument || stop != end)
        return kReal;
    return error == std::errc() ? std::string_view() : kDouble;
}

}  // namespace

std::string_view parseMofNumber(MofToken& token) {
    std::string_view digits = token.text;
    token.negative = digits.front() == '-';
    if (token.negative || digits.front() == '+')
        digits.remove_prefix(1);
    if (digits.find('.') == std::string_view::npos) {
        token.kind = MofTokenKind::Integer;
        return parseInteger(digits, token.magnitude);
    }
    token.kind = MofTokenKind::Real;
    const std::string_view expected = parseReal(digits, token.real);
    if (token.negative)
        token.real = -token.real;
    return expected;
}

}  // namespace cimomd
