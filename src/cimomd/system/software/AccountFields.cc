#include "system/software/AccountFields.h"

#include <limits>

#include "files/TextFields.h"
#include "text/Utf8.h"

namespace cimomd {

bool isAccountName(std::string_view name) {
    return !name.empty() && name.front() != '+' && name.front() != '-' && name.front() != '#';
}

std::optional<std::uint32_t> accountNumber(std::string_view text) {
    const auto number = parseUnsigned(text);
    if (!number || *number >= std::numeric_limits<std::uint32_t>::max())
        return std::nullopt;
    return static_cast<std::uint32_t>(*number);
}

std::vector<std::string> listedTexts(std::string_view field) {
    std::vector<std::string> texts;
    for (const std::string_view part : partsOf(field, ',')) {
        if (!trimmed(part).empty())
            texts.emplace_back(trimmed(part));
    }
    return texts;
}

}  // namespace cimomd
