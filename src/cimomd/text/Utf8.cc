#include "text/Utf8.h"

#include <algorithm>

#include "utf8/Utf8.h"

namespace cimomd {
namespace {

constexpr std::string_view kWhiteSpace("\0 \t\r\n\f\v", 7);

bool isForbiddenControl(char c) {
    const auto byte = static_cast<unsigned char>(c);
    return (byte < 0x20 && c != '\t' && c != '\n' && c != '\r') || byte == 0x7F;
}

char lowerCaseOf(char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

/// All of it characters of ASCII, none of them forbidden.
bool isCleanAscii(std::string_view bytes) {
    bool isClean = true;
    for (const char c : bytes)
        isClean &= (c >= 0x20 && c < 0x7F) || c == '\t' || c == '\n' || c == '\r';
    return isClean;
}

}  // namespace

std::string cleanText(std::string_view bytes) {
    std::string room;
    return std::string(cleanText(bytes, room));
}

std::string_view cleanText(std::string_view bytes, std::string& room) {
    if (isCleanAscii(bytes))
        return bytes;
    room.clear();
    for (const char c : utf8::clean(bytes)) {
        if (isForbiddenControl(c))
            room += utf8::kReplacement;
        else
            room += c;
    }
    return room;
}

std::string_view firstCharacters(std::string_view text, std::size_t maxCharacters) {
    if (text.size() <= maxCharacters)
        return text;
    std::size_t offset = 0;
    std::size_t units = 0;
    while (offset < text.size()) {
        const std::size_t length =
            std::max<std::size_t>(1, utf8::characterLength(text.substr(offset)));
        units += length == 4 ? 2 : 1;
        if (units > maxCharacters)
            break;
        offset += length;
    }
    return text.substr(0, offset);
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
