#include "Utf8.h"

#include <cstring>

namespace Pegasus {

namespace {

constexpr Uint32 kReplacement = 0xFFFD;
constexpr Uint32 kLastCode = 0x10FFFF;

Boolean isSurrogate(Uint32 code) {
    return code >= 0xD800 && code <= 0xDFFF;
}

Uint8 byteAt(const char* bytes, std::size_t index) {
    return static_cast<Uint8>(bytes[index]);
}

/// What a lead byte promises. `length` is 0 for a byte that begins no sequence.
struct Sequence {
    std::size_t length;
    Uint32 leadBits;
    Uint32 smallestCode;
};

Sequence sequenceOf(Uint8 lead) {
    if (lead < 0x80)
        return {1, lead, 0};
    if (lead >= 0xC2 && lead <= 0xDF)
        return {2, lead & 0x1FU, 0x80};
    if (lead >= 0xE0 && lead <= 0xEF)
        return {3, lead & 0x0FU, 0x800};
    if (lead >= 0xF0 && lead <= 0xF4)
        return {4, lead & 0x07U, 0x10000};
    return {0, 0, 0};
}

/// The code that begins at `at`; its length goes to `length`, 0 when there is no valid one.
Uint32 decodeOne(const char* bytes, std::size_t n, std::size_t at, std::size_t& length) {
    const Sequence sequence = sequenceOf(byteAt(bytes, at));
    length = 0;
    if (sequence.length == 0 || sequence.length > n - at)
        return 0;
    Uint32 code = sequence.leadBits;
    for (std::size_t i = 1; i < sequence.length; ++i) {
        const Uint8 next = byteAt(bytes, at + i);
        if ((next & 0xC0) != 0x80)
            return 0;
        code = code << 6 | (next & 0x3FU);
    }
    if (code < sequence.smallestCode || code > kLastCode || isSurrogate(code))
        return 0;
    length = sequence.length;
    return code;
}

void appendCode(std::string& out, Uint32 code) {
    const auto tail = [&](unsigned shift) {
        out += static_cast<char>(0x80 | (code >> shift & 0x3F));
    };
    if (code < 0x80) {
        out += static_cast<char>(code);
    } else if (code < 0x800) {
        out += static_cast<char>(0xC0 | code >> 6);
        tail(0);
    } else if (code < 0x10000) {
        out += static_cast<char>(0xE0 | code >> 12);
        tail(6);
        tail(0);
    } else {
        out += static_cast<char>(0xF0 | code >> 18);
        tail(12);
        tail(6);
        tail(0);
    }
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
        seen |= byteAt(bytes, i);
    return seen < 0x80;
}

std::size_t utf16Length(const char* bytes, std::size_t n) {
    std::size_t length = 0;
    for (std::size_t i = 0; i < n; ++i) {
        const Uint8 byte = byteAt(bytes, i);
        length += (byte & 0xC0) != 0x80;
        length += byte >= 0xF0;
    }
    return length;
}

std::size_t decodeUtf8(const char* bytes, std::size_t n, Char16* out) {
    std::size_t length = 0;
    for (std::size_t at = 0; at < n; at += length) {
        const Uint32 code = decodeOne(bytes, n, at, length);
        if (length == 0)
            return at;
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
    std::string out;
    out.reserve(n);
    for (std::size_t i = 0; i < n; ++i) {
        const Uint32 unit = text[i];
        if (!isSurrogate(unit)) {
            appendCode(out, unit);
            continue;
        }
        const Uint32 next = i + 1 < n ? Uint32{text[i + 1]} : 0;
        if (unit < 0xDC00 && next >= 0xDC00 && next <= 0xDFFF) {
            appendCode(out, 0x10000 + ((unit - 0xD800) << 10) + (next - 0xDC00));
            ++i;
        } else {
            appendCode(out, kReplacement);
        }
    }
    return out;
}

}  // namespace Pegasus
