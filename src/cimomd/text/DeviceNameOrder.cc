#include "text/DeviceNameOrder.h"

#include <algorithm>

#include "text/NaturalOrder.h"

namespace cimomd {
namespace {

std::size_t lettersBeforeDigits(std::string_view name) {
    return std::min(name.find_first_of("0123456789"), name.size());
}

}  // namespace

bool deviceNameLess(std::string_view a, std::string_view b) {
    const std::size_t lettersOfA = lettersBeforeDigits(a);
    const std::size_t lettersOfB = lettersBeforeDigits(b);
    return lettersOfA != lettersOfB ? lettersOfA < lettersOfB : naturallyBefore(a, b);
}

}  // namespace cimomd
