// UTF-8 (RFC 3629), character by character. Overlong forms, coded surrogates and codes above
// U+10FFFF are no characters here.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace utf8 {

inline constexpr std::string_view kReplacement = "\xEF\xBF\xBD";

constexpr bool isContinuation(char byte) {
    return (static_cast<unsigned char>(byte) & 0xC0U) == 0x80;
}

/// How many bytes a character with this first byte has; 0 for a byte that begins none.
constexpr std::size_t lengthByLead(char byte) {
    const auto lead = static_cast<unsigned char>(byte);
    if (lead < 0x80) {
        return 1;
    }
    if (lead < 0xC2 || lead > 0xF4) {
        return 0;
    }
    if (lead < 0xE0) {
        return 2;
    }
    return lead < 0xF0 ? 3 : 4;
}

/// Whether `second` may follow `lead`, the first byte of a longer character. Narrower after E0, ED,
/// F0 and F4: that is what keeps overlong forms, surrogates and too large codes out.
constexpr bool isSecondByte(char lead, char second) {
    const auto byte = static_cast<unsigned char>(second);
    switch (static_cast<unsigned char>(lead)) {
        case 0xE0:
            return byte >= 0xA0 && byte <= 0xBF;
        case 0xED:
            return byte >= 0x80 && byte <= 0x9F;
        case 0xF0:
            return byte >= 0x90 && byte <= 0xBF;
        case 0xF4:
            return byte >= 0x80 && byte <= 0x8F;
        default:
            return isContinuation(second);
    }
}

/// Whether `bytes`, not empty, are a character of `length` bytes at their front, or end within one.
constexpr bool beginsCharacter(std::string_view bytes, std::size_t length) {
    if (length == 0 || (length > 1 && bytes.size() > 1 && !isSecondByte(bytes[0], bytes[1]))) {
        return false;
    }
    for (std::size_t i = 2; i < length && i < bytes.size(); ++i) {
        if (!isContinuation(bytes[i])) {
            return false;
        }
    }
    return true;
}

/// The length of the character at the front of `bytes`, not empty; 0 when there is none.
constexpr std::size_t characterLength(std::string_view bytes) {
    const std::size_t length = lengthByLead(bytes[0]);
    return length <= bytes.size() && beginsCharacter(bytes, length) ? length : 0;
}

/// Whether `bytes`, not empty, are the beginning of a character whose other bytes are missing.
constexpr bool isCutCharacter(std::string_view bytes) {
    const std::size_t length = lengthByLead(bytes[0]);
    return length > bytes.size() && beginsCharacter(bytes, length);
}

/// The code of the character at the front of `bytes`, of this characterLength().
constexpr char32_t decode(std::string_view bytes, std::size_t length) {
    char32_t code = static_cast<unsigned char>(bytes[0]);
    if (length > 1) {
        code &= 0x7FU >> length;
    }
    for (std::size_t i = 1; i < length; ++i) {
        code = (code << 6U) | (static_cast<unsigned char>(bytes[i]) & 0x3FU);
    }
    return code;
}

/// The halves in which UTF-16 writes the codes above U+FFFF.
constexpr bool isHighSurrogate(char32_t unit) {
    return unit >= 0xD800 && unit <= 0xDBFF;
}

constexpr bool isLowSurrogate(char32_t unit) {
    return unit >= 0xDC00 && unit <= 0xDFFF;
}

constexpr char32_t joinSurrogates(char32_t high, char32_t low) {
    return 0x10000 + ((high - 0xD800) << 10U) + (low - 0xDC00);
}

/// Writes a code of at most U+10FFFF to `out`, 1 to 4 bytes; returns the end.
char* put(char* out, char32_t code);

/// Appends a character; U+FFFD for surrogates and for codes above U+10FFFF.
void append(std::string& out, char32_t code);

/// `bytes` with U+FFFD in place of every byte that is not part of a character.
std::string clean(std::string_view bytes);

}  // namespace utf8
