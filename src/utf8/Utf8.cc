#include "utf8/Utf8.h"

#include <array>

namespace utf8 {

char* put(char* out, char32_t code) {
    const auto putByte = [&out](char32_t byte) { *out++ = static_cast<char>(byte); };
    const auto putTail = [&putByte, code](unsigned shift) {
        putByte(0x80U | ((code >> shift) & 0x3FU));
    };
    if (code < 0x80) {
        putByte(code);
    } else if (code < 0x800) {
        putByte(0xC0U | (code >> 6U));
        putTail(0);
    } else if (code < 0x10000) {
        putByte(0xE0U | (code >> 12U));
        putTail(6);
        putTail(0);
    } else {
        putByte(0xF0U | (code >> 18U));
        putTail(12);
        putTail(6);
        putTail(0);
    }
    return out;
}

void append(std::string& out, char32_t code) {
    if (code > 0x10FFFF || isHighSurrogate(code) || isLowSurrogate(code)) {
        out += kReplacement;
        return;
    }
    std::array<char, 4> bytes{};
    char* const begin = bytes.data();
    out.append(begin, put(begin, code));
}

std::string clean(std::string_view bytes) {
    std::string out;
    out.reserve(bytes.size());
    while (!bytes.empty()) {
        const std::size_t length = characterLength(bytes);
        if (length == 0) {
            out += kReplacement;
            bytes.remove_prefix(1);
        } else {
            out += bytes.substr(0, length);
            bytes.remove_prefix(length);
        }
    }
    return out;
}

}  // namespace utf8
