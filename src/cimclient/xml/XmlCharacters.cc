#include "xml/XmlCharacters.h"

#include <algorithm>

#include "utf8/Utf8.h"

namespace Pegasus {

namespace {

constexpr std::size_t kBlock = 64;
constexpr std::size_t kQuotedOctets = 60;

constexpr std::uint8_t octet(char c) {
    return static_cast<std::uint8_t>(c);
}

constexpr bool isPlainAscii(std::uint8_t c) {
    return (c >= 0x20 && c < 0x80) || c == '\t' || c == '\n' || c == '\r';
}

// Without a branch in the loop, so that the compiler makes vector code of it.
bool isPlainBlock(const char* block) {
    std::uint8_t odd = 0;
    for (std::size_t i = 0; i < kBlock; ++i) {
        const std::uint8_t c = octet(block[i]);
        const std::uint8_t control = c < 0x20 ? 1 : 0;
        const std::uint8_t space = (c == '\t' || c == '\n' || c == '\r') ? 1 : 0;
        odd |= static_cast<std::uint8_t>((control ^ space) | (c & 0x80U));
    }
    return odd == 0;
}

struct Sequence {
    std::size_t size;
    OctetCheck::Verdict verdict;
};

// The character at the front of `octets`, whose first octet is above 127.
Sequence checkSequence(std::string_view octets) {
    const std::size_t size = utf8::characterLength(octets);
    if (size == 0) {
        return {0, utf8::isCutCharacter(octets) ? OctetCheck::Verdict::Incomplete
                                                : OctetCheck::Verdict::InvalidUtf8};
    }
    const std::string_view character = octets.substr(0, size);
    if (character == "\xEF\xBF\xBE" || character == "\xEF\xBF\xBF") {
        return {0, OctetCheck::Verdict::ForbiddenCharacter};
    }
    return {size, OctetCheck::Verdict::Good};
}

}  // namespace

std::string_view trimXmlSpace(std::string_view text) {
    while (!text.empty() && isXmlSpace(text.front())) {
        text.remove_prefix(1);
    }
    while (!text.empty() && isXmlSpace(text.back())) {
        text.remove_suffix(1);
    }
    return text;
}

bool equalsIgnoringCase(std::string_view a, std::string_view b) {
    const auto lower = [](char c) {
        return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
    };
    return std::equal(a.begin(), a.end(), b.begin(), b.end(),
                      [&lower](char x, char y) { return lower(x) == lower(y); });
}

bool isBlank(std::string_view text) {
    return trimXmlSpace(text).empty();
}

OctetCheck checkOctets(std::string_view octets) {
    std::size_t i = 0;
    while (i < octets.size()) {
        if (octets.size() - i >= kBlock && isPlainBlock(octets.data() + i)) {
            i += kBlock;
            continue;
        }
        const std::size_t blockEnd = std::min(octets.size(), i + kBlock);
        while (i < blockEnd) {
            if (isPlainAscii(octet(octets[i]))) {
                ++i;
                continue;
            }
            if (octet(octets[i]) < 0x80) {
                return {i, OctetCheck::Verdict::ForbiddenCharacter};
            }
            const Sequence sequence = checkSequence(octets.substr(i));
            if (sequence.verdict != OctetCheck::Verdict::Good) {
                return {i, sequence.verdict};
            }
            i += sequence.size;
        }
    }
    return {i, OctetCheck::Verdict::Good};
}

std::string quotedForMessage(std::string_view text) {
    std::size_t size = std::min(text.size(), kQuotedOctets);
    while (size > 0 && size < text.size() && utf8::isContinuation(text[size])) {
        --size;
    }
    std::string quoted = "\"";
    for (const char c : text.substr(0, size)) {
        quoted += octet(c) < 0x20 || c == 0x7F ? '?' : c;
    }
    quoted += size < text.size() ? "...\"" : "\"";
    return quoted;
}

}  // namespace Pegasus
