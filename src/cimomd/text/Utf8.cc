#include "text/Utf8.h"

#include <algorithm>

namespace cimomd {
namespace {

constexpr std::string_view kReplacement = "\xEF\xBF\xBD";
constexpr std::string_view kWhiteSpace("\0 \t\r\n\f\v", 7);

unsigned char byteAt(std::string_view bytes, std::size_t index) {
    return index < bytes.size() ? static_cast<unsigned char>(bytes[index]) : 0;
}

bool isBetween(unsigned char byte, unsigned char low, unsigned char high) {
    return byte >= low && byte <= high;
}

// The smallest and largest second byte keep out overlong forms, surrogates and codes above
// U+10FFFF.
std::size_t threeByteLength(std::string_view bytes, unsigned char lead) {
    const unsigned char low = lead == 0xE0 ? 0xA0 : 0x80;
    const unsigned char high = lead == 0xED ? 0x9F : 0xBF;
    const bool good =
        isBetween(byteAt(bytes, 1), low, high) && isBetween(byteAt(bytes, 2), 0x80, 0xBF);
    return good ? 3 : 0;
}

std::size_t fourByteLength(std::string_view bytes, unsigned char lead) {
    const unsigned char low = lead == 0xF0 ? 0x90 : 0x80;
    const unsigned char high = lead == 0xF4 ? 0x8F : 0xBF;
    const bool good = isBetween(byteAt(bytes, 1), low, high) &&
                      isBetween(byteAt(bytes, 2), 0x80, 0xBF) &&
                      isBetween(byteAt(bytes, 3), 0x80, 0xBF);
    return good ? 4 : 0;
}

/// Length of the well-formed character at the front of non-empty `bytes`, 0 when there is none.
std::size_t characterLength(std::string_view bytes) {
    const unsigned char lead = byteAt(bytes, 0);
    if (lead < 0x80)
        return 1;
    if (isBetween(lead, 0xC2, 0xDF))
        return isBetween(byteAt(bytes, 1), 0x80, 0xBF) ? 2 : 0;
    if (isBetween(lead, 0xE0, 0xEF))
        return threeByteLength(bytes, lead);
    if (isBetween(lead, 0xF0, 0xF4))
        return fourByteLength(bytes, lead);
    return 0;
}

bool isForbiddenControl(std::string_view character) {
    const unsigned char byte = byteAt(character, 0);
    const bool allowed = byte >= 0x20 || byte == '\t' || byte == '\n' || byte == '\r';
    return !allowed || byte == 0x7F;
}

char lowerCaseOf(char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

std::string clean(std::string_view bytes, bool replaceControls) {
    std::string out;
    out.reserve(bytes.size());
    while (!bytes.empty()) {
        const std::size_t length = characterLength(bytes);
        const std::string_view character = bytes.substr(0, length);
        if (length == 0 || (replaceControls && isForbiddenControl(character)))
            out += kReplacement;
        else
            out += character;
        bytes.remove_prefix(length == 0 ? 1 : length);
    }
    return out;
}

}  // namespace

void appendUtf8(std::string& out, char32_t code) {
    if (code > 0x10FFFF || (code >= 0xD800 && code <= 0xDFFF)) {
        out += kReplacement;
    } else if (code < 0x80) {
        out += static_cast<char>(code);
    } else if (code < 0x800) {
        out += static_cast<char>(0xC0 | (code >> 6));
        out += static_cast<char>(0x80 | (code & 0x3F));
    } else if (code < 0x10000) {
        out += static_cast<char>(0xE0 | (code >> 12));
        out += static_cast<char>(0x80 | ((code >> 6) & 0x3F));
        out += static_cast<char>(0x80 | (code & 0x3F));
    } else {
        out += static_cast<char>(0xF0 | (code >> 18));
        out += static_cast<char>(0x80 | ((code >> 12) & 0x3F));
        out += static_cast<char>(0x80 | ((code >> 6) & 0x3F));
        out += static_cast<char>(0x80 | (code & 0x3F));
    }
}

std::string cleanUtf8(std::string_view bytes) {
    return clean(bytes, false);
}

std::string cleanText(std::string_view bytes) {
    return clean(bytes, true);
}

std::string_view firstCharacters(std::string_view utf8, std::size_t maxCharacters) {
    std::size_t offset = 0;
    std::size_t units = 0;
    while (offset < utf8.size()) {
        const std::size_t length = std::max<std::size_t>(1, characterLength(utf8.substr(offset)));
        units += length == 4 ? 2 : 1;
        if (units > maxCharacters)
            break;
        offset += length;
    }
    return utf8.substr(0, offset);
}

bool equalsIgnoringCase(std::string_view a, std::string_view b) {
    return std::equal(a.begin(), a.end(), b.begin(), b.end(),
                      [](char x, char y) { return lowerCaseOf(x) == lowerCaseOf(y); });
}

std::string lowerCase(std::string_view text) {
    std::string out(text);
    std::transform(out.begin(), out.end(), out.begin(), lowerCaseOf);
    return out;
}

std::string_view trimmed(std::string_view text) {
    const std::size_t first = text.find_first_not_of(kWhiteSpace);
    if (first == std::string_view::npos)
        return {};
    return text.substr(first, text.find_last_not_of(kWhiteSpace) - first + 1);
}

}  // namespace cimomd
