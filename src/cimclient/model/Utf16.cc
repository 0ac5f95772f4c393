#include "Utf16.h"

#include <cstring>
#include <string_view>

#include "utf8/Utf8.h"

namespace Pegasus {

namespace {

/// Copies the characters at the front up to the first that is not ASCII; how many these were.
std::size_t copyAscii(const Char16* text, std::size_t n, char* out) {
    constexpr std::size_t kBlock = 16;
    std::size_t i = 0;
    for (; n - i >= kBlock; i += kBlock) {
        Uint16 seen = 0;
        for (std::size_t k = 0; k < kBlock; ++k)
            seen |= text[i + k];
        if (seen >= 0x80)
            break;
        for (std::size_t k = 0; k < kBlock; ++k)
            out[i + k] = static_cast<char>(Uint16{text[i + k]});
    }
    for (; i < n && text[i] < 0x80; ++i)
        out[i] = static_cast<char>(Uint16{text[i]});
    return i;
}

}  // namespace

Boolean isAscii(const char* bytes, std::size_t n) {
    std::size_t i = 0;
    for (Uint64 word = 0; n - i >= sizeof(word); i += sizeof(word)) {
        std::memcpy(&word, bytes + i, sizeof(word));
        if (word & 0x8080808080808080U)
            return false;
    }
    Uint8 seen = 0;
    for (; i < n; ++i)
        seen |= static_cast<Uint8>(bytes[i]);
    return seen < 0x80;
}

std::size_t utf16Length(const char* bytes, std::size_t n) {
    std::size_t length = 0;
    for (std::size_t i = 0; i < n; ++i) {
        length += !utf8::isContinuation(bytes[i]);
        length += static_cast<Uint8>(bytes[i]) >= 0xF0;
    }
    return length;
}

std::size_t decodeUtf8(const char* bytes, std::size_t n, Char16* out) {
    std::size_t length = 0;
    for (std::size_t at = 0; at < n; at += length) {
        const std::string_view rest(bytes + at, n - at);
        length = utf8::characterLength(rest);
        if (length == 0)
            return at;
        const Uint32 code = utf8::decode(rest, length);
        if (code < 0x10000) {
            *out++ = static_cast<Uint16>(code);
        } else {
            *out++ = static_cast<Uint16>(0xD7C0 + (code >> 10));
            *out++ = static_cast<Uint16>(0xDC00 | (code & 0x3FF));
        }
    }
    return n;
}

std::string encodeUtf8(const Char16* text, std::size_t n) {
    std::string out(n, '\0');
    const std::size_t ascii = copyAscii(text, n, out.data());
    out.resize(ascii);
    for (std::size_t i = ascii; i < n; ++i) {
        const Uint32 unit = text[i];
        const Uint32 next = i + 1 < n ? Uint32{text[i + 1]} : 0;
        if (utf8::isHighSurrogate(unit) && utf8::isLowSurrogate(next)) {
            utf8::append(out, utf8::joinSurrogates(unit, next));
            ++i;
        } else if (unit < 0x80) {
            out += static_cast<char>(unit);
        } else {
            utf8::append(out, unit);
        }
    }
    return out;
}

}  // namespace Pegasus
