#include "xml/XmlCharacters.h"

#include <algorithm>

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

constexpr bool isContinuation(std::uint8_t c) {
    return (c & 0xC0U) == 0x80;
}

struct Sequence {
    std::size_t size;
    OctetCheck::Verdict verdict;
};

// The allowed second octets are narrower after E0, ED, F0 and F4: that is what keeps overlong
// forms, surrogates and codes above U+10FFFF out.
bool isSecondOctet(std::uint8_t lead, std::uint8_t second) {
    switch (lead) {
        case 0xE0:
            return second >= 0xA0 && second <= 0xBF;
        case 0xED:
            return second >= 0x80 && second <= 0x9F;
        case 0xF0:
            return second >= 0x90 && second <= 0xBF;
        case 0xF4:
            return second >= 0x80 && second <= 0x8F;
        default:
            return isContinuation(second);
    }
}

std::size_t sequenceSize(std::uint8_t lead) {
    if (lead >= 0xC2 && lead <= 0xDF) {
        return 2;
    }
    if (lead >= 0xE0 && lead <= 0xEF) {
        return 3;
    }
    return lead >= 0xF0 && lead <= 0xF4 ? 4 : 0;
}

// The character at the front of `octets`, whose first octet is above 127.
Sequence checkSequence(std::string_view octets) {
    const std::uint8_t lead = octet(octets[0]);
    const std::size_t size = sequenceSize(lead);
    if (size == 0) {
        return {0, OctetCheck::Verdict::InvalidUtf8};
    }
    if (octets.size() > 1 && !isSecondOctet(lead, octet(octets[1]))) {
        return {0, OctetCheck::Verdict::InvalidUtf8};
    }
    for (std::size_t i = 2; i < size && i < octets.size(); ++i) {
        if (!isContinuation(octet(octets[i]))) {
            return {0, OctetCheck::Verdict::InvalidUtf8};
        }
    }
    if (octets.size() < size) {
        return {0, OctetCheck::Verdict::Incomplete};
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

char* putUtf8(char* out, std::uint32_t code) {
    const auto put = [&out](std::uint32_t value) { *out++ = static_cast<char>(value); };
    if (code < 0x80) {
        put(code);
    } else if (code < 0x800) {
        put(0xC0U | (code >> 6U));
        put(0x80U | (code & 0x3FU));
    } else if (code < 0x10000) {
        put(0xE0U | (code >> 12U));
        put(0x80U | ((code >> 6U) & 0x3FU));
        put(0x80U | (code & 0x3FU));
    } else {
        put(0xF0U | (code >> 18U));
        put(0x80U | ((code >> 12U) & 0x3FU));
        put(0x80U | ((code >> 6U) & 0x3FU));
        put(0x80U | (code & 0x3FU));
    }
    return out;
}

std::string quotedForMessage(std::string_view text) {
    std::size_t size = std::min(text.size(), kQuotedOctets);
    while (size > 0 && size < text.size() && isContinuation(octet(text[size]))) {
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
