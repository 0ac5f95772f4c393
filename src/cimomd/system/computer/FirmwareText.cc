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
    return count != 1;
}

}  // namespace

bool isPlaceholder(std::string_view text) {
    const std::string_view value = trimmed(text);
    return isRepetition(value) ||
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
