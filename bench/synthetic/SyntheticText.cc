#include "bench/synthetic/SyntheticText.h"

#include <array>
#include <string_view>

namespace bench {

namespace {

constexpr std::array<std::string_view, 48> kWords{
    "the",   "value",      "of",     "this",    "unit",     "is",    "given",   "by",
    "a",     "controller", "when",   "it",      "starts",   "and",   "may",     "change",
    "later", "bay",        "module", "number",  "holds",    "in",    "order",   "which",
    "state", "cable",      "left",   "upper",   "spare",    "reads", "counter", "firmware",
    "power", "supply",     "slot",   "carrier", "revision", "board", "remote",  "lower",
    "shelf", "primary",    "blade",  "sensor",  "not",      "known", "to",      "all"};

constexpr std::array<std::string_view, 6> kOddities{
    " & Co", " <rev>", " \"B\"", " \xc3\xa9t\xc3\xa9", " \xe2\x84\xa2", " 5'"};

}  // namespace

std::string words(Random& random, std::size_t length) {
    std::string text;
    while (text.size() < length) {
        if (!text.empty()) {
            text += ' ';
        }
        text += kWords[random.below(kWords.size())];
    }
    return text;
}

std::string vendorText(Random& random, std::size_t length) {
    constexpr std::uint64_t kOneIn = 24;
    std::string text = words(random, length - 4);
    if (random.below(kOneIn) == 0) {
        text += kOddities[random.below(kOddities.size())];
    }
    return text;
}

std::string description(Random& random, std::size_t length) {
    std::string text;
    while (text.size() < length) {
        std::string sentence = words(random, 40 + random.below(100));
        sentence[0] = static_cast<char>(sentence[0] - 'a' + 'A');
        text += text.empty() ? "" : random.below(4) == 0 ? " \n" : " ";
        text += sentence + (random.below(6) == 0 ? " (see \"" + words(random, 8) + "\")." : ".");
    }
    return text;
}

}  // namespace bench
