#include "bench/synthetic/SyntheticClass.h"

#include <array>
#include <string_view>

namespace bench {

namespace {

struct Pattern {
    std::string_view name;
    Kind kind;
};

constexpr std::array<Pattern, 20> kPatterns{{{"DeviceID", Kind::Text},
                                             {"SystemName", Kind::Text},
                                             {"ElementName", Kind::Text},
                                             {"Manufacturer", Kind::Text},
                                             {"Model", Kind::Text},
                                             {"SerialNumber", Kind::Text},
                                             {"PartNumber", Kind::Text},
                                             {"Location", Kind::Text},
                                             {"EnabledState", Kind::Enumeration},
                                             {"HealthState", Kind::Enumeration},
                                             {"OperationalStatus", Kind::EnumerationArray},
                                             {"OtherNames", Kind::TextArray},
                                             {"InstallDate", Kind::DateTime},
                                             {"Speed", Kind::Uint32},
                                             {"DataWidth", Kind::Uint32},
                                             {"Capacity", Kind::Uint64},
                                             {"Offset", Kind::Sint64},
                                             {"Removable", Kind::Boolean},
                                             {"Voltage", Kind::Real32},
                                             {"Temperature", Kind::Real64}}};

constexpr std::size_t kInherited = 26;

// The line of an inventory script that lists a class's properties has at most 1,024 bytes: more
// than this many have names of two characters.
constexpr std::size_t kMaxReadable = 60;

std::string shortName(std::size_t number) {
    constexpr std::string_view kDigits = "0123456789abcdefghijklmnopqrstuvwxyz";
    return {static_cast<char>('A' + number / kDigits.size()), kDigits[number % kDigits.size()]};
}

std::string readableName(std::string_view prefix, std::size_t number) {
    const std::size_t turn = number / kPatterns.size();
    return std::string(prefix) + std::string(kPatterns[number % kPatterns.size()].name) +
           (turn == 0 ? "" : std::to_string(turn));
}

std::vector<SyntheticProperty> makeProperties(std::string_view prefix, std::size_t count) {
    std::vector<SyntheticProperty> properties;
    for (std::size_t i = 0; i < count; ++i) {
        properties.push_back({count > kMaxReadable ? shortName(i) : readableName(prefix, i),
                              kPatterns[i % kPatterns.size()].kind, false});
    }
    return properties;
}

std::string threeDigits(std::size_t number) {
    const std::string digits = std::to_string(number);
    return std::string(digits.size() < 3 ? 3 - digits.size() : 0, '0') + digits;
}

}  // namespace

const char* SyntheticProperty::type() const {
    switch (kind) {
        case Kind::Text:
        case Kind::TextArray:
            return "string";
        case Kind::Enumeration:
        case Kind::EnumerationArray:
            return "uint16";
        case Kind::DateTime:
            return "datetime";
        case Kind::Uint32:
            return "uint32";
        case Kind::Uint64:
            return "uint64";
        case Kind::Sint64:
            return "sint64";
        case Kind::Boolean:
            return "boolean";
        case Kind::Real32:
            return "real32";
        case Kind::Real64:
            break;
    }
    return "real64";
}

const std::vector<std::string>& stateTexts() {
    static const std::vector<std::string> texts{"Not Known",      "Of Another Kind",
                                                "Ready",          "Ready With Losses",
                                                "Under Load",     "About To Fail",
                                                "Failed",         "Beyond Repair",
                                                "Starting Up",    "Shutting Down",
                                                "Stopped",        "Being Serviced",
                                                "Not Reachable",  "Lost",
                                                "Given Up",       "Asleep",
                                                "Depends",        "Done",
                                                "Short Of Power", "Moving"};
    return texts;
}

SyntheticClass makeClass(std::size_t number, std::size_t properties) {
    SyntheticClass made{"Bench_Device" + threeDigits(number), makeProperties("", properties),
                        makeProperties("Base", kInherited)};
    made.properties.front().isKey = true;
    return made;
}

}  // namespace bench
