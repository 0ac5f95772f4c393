#include "system/computer/FirmwareText.h"

#include <algorithm>
#include <array>

#include "files/TextFile.h"
#include "text/Utf8.h"

namespace cimomd {
namespace {

constexpr std::array<std::string_view, 19> kPlaceholders{"To be filled by O.E.M.",
                                                         "Default string",
                                                         "System Serial Number",
                                                         "System Product Name",
                                                         "System manufacturer",
                                                         "Chassis Serial Number",
                                                         "Base Board Serial Number",
                                                         "Not Specified",
                                                         "Not Applicable",
                                                         "None",
                                                         "Unknown",
                                                         "N/A",
                                                         "No Asset Tag",
                                                         "No Asset Information",
                                                         "Not Available",
                                                         "INVALID",
                                                         "0123456789",
                                                         "123456789",
                                                         ""};

// Two equal characters are a plausible revision or slot: "AA", "11".
constexpr std::size_t kLeastRepeated = 3;

bool isRepetition(std::string_view text) {
    char repeated = '\0';
    std::size_t count = 0;
    for (const char c : lowerCase(text)) {
        if (c == '-' || c == ' ')
            continue;
        if (count != 0 && c != repeated)
            return false;
        repeated = c;
        ++count;
    }
    return count == 0 || count >= kLeastRepeated;
}

/// What some firmware prints for a number that nobody set.
bool isHexadecimalZero(std::string_view text) {
    return text.size() > 2 && equalsIgnoringCase(text.substr(0, 2), "0x") &&
           text.find_first_not_of('0', 2) == std::string_view::npos;
}

}  // namespace

bool isPlaceholder(std::string_view text) {
    const std::string_view value = trimmed(text);
    return isRepetition(value) || isHexadecimalZero(value) ||
           std::any_of(kPlaceholders.begin(), kPlaceholders.end(), [value](std::string_view known) {
               return equalsIgnoringCase(known, value);
           });
}

Fact<std::string> withoutPlaceholder(const Fact<std::string>& text) {
    return text.then([](const std::string& found) {
        return isPlaceholder(found) ? std::nullopt : std::optional<std::string>(trimmed(found));
    });
}

Fact<std::string> readFirmwareText(const std::filesystem::path& path) {
    return withoutPlaceholder(readFact(path));
}

}  // namespace cimomd
