#include "bench/synthetic/SyntheticInstance.h"

#include <array>
#include <cstdio>

#include "bench/synthetic/SyntheticText.h"

namespace bench {

namespace {

constexpr std::size_t kTextLength = 30;

template <typename... Parts>
std::string formatted(const char* format, Parts... parts) {
    std::array<char, 64> buffer{};
    std::snprintf(buffer.data(), buffer.size(), format, parts...);
    return buffer.data();
}

std::string dateTime(Random& random) {
    const auto part = [&](unsigned from, unsigned count) {
        return static_cast<unsigned>(from + random.below(count));
    };
    const unsigned year = part(2001, 25);
    const unsigned month = part(1, 12);
    const unsigned day = part(1, 28);
    const unsigned hour = part(0, 24);
    const unsigned minute = part(0, 60);
    const unsigned second = part(0, 60);
    return formatted("%04u%02u%02u%02u%02u%02u.%06u+060", year, month, day, hour, minute, second,
                     part(0, 1000000));
}

std::string state(Random& random) {
    return std::to_string(random.below(stateTexts().size()));
}

double fraction(Random& random) {
    return static_cast<double>(random.below(1000000)) / 7919.0;
}

std::vector<std::string> several(Random& random, std::string (*make)(Random&)) {
    std::vector<std::string> texts;
    const std::size_t count = 1 + random.below(3);
    for (std::size_t i = 0; i < count; ++i) {
        texts.push_back(make(random));
    }
    return texts;
}

std::vector<std::string> makeValue(Kind kind, Random& random) {
    switch (kind) {
        case Kind::Text:
            return {vendorText(random, kTextLength)};
        case Kind::Enumeration:
            return {state(random)};
        case Kind::EnumerationArray:
            return several(random, state);
        case Kind::TextArray:
            return several(random, [](Random& source) { return words(source, 12); });
        case Kind::DateTime:
            return {dateTime(random)};
        case Kind::Uint32:
            return {std::to_string(random.below(4294967296U))};
        case Kind::Uint64:
            return {std::to_string(random.next() >> random.below(40))};
        case Kind::Sint64:
            return {std::to_string(static_cast<std::int64_t>(random.next()) >> random.below(40))};
        case Kind::Boolean:
            return {random.below(2) == 0 ? "FALSE" : "TRUE"};
        case Kind::Real32:
            return {formatted("%.7e", fraction(random))};
        case Kind::Real64:
            break;
    }
    return {formatted("%.16e", fraction(random))};
}

}  // namespace

InstanceTexts makeInstance(const SyntheticClass& synthetic, std::size_t number, Random& random) {
    InstanceTexts texts;
    for (const SyntheticProperty& property : synthetic.properties) {
        if (property.isKey) {
            texts.push_back({formatted("%s-%08zu-rack-of-room", property.name.c_str(), number)});
        } else {
            texts.push_back(makeValue(property.kind, random));
        }
    }
    return texts;
}

}  // namespace bench
