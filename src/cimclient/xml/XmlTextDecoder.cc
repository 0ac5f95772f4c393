#include "xml/XmlTextDecoder.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string_view>
#include <utility>

#include "utf8/Utf8.h"
#include "xml/XmlCharacters.h"

namespace Pegasus {

namespace {

// A value of 16 or more for what is no digit.
std::uint32_t digitValue(char c) {
    if (c >= '0' && c <= '9') {
        return static_cast<std::uint32_t>(c - '0');
    }
    const char lower = static_cast<char>(c | 0x20);
    return lower >= 'a' && lower <= 'f' ? static_cast<std::uint32_t>(lower - 'a') + 10 : 16;
}

// `number` is what stands between "&#" and ";". 0 for what names no character.
std::uint32_t parseCharacterNumber(std::string_view number) {
    std::uint32_t radix = 10;
    if (number.starts_with('x')) {
        radix = 16;
        number.remove_prefix(1);
    }
    std::uint32_t code = 0;
    for (const char c : number) {
        const std::uint32_t digit = digitValue(c);
        if (digit >= radix || code > 0x10FFFF) {
            return 0;
        }
        code = code * radix + digit;
    }
    return isReferable(code) ? code : 0;
}

// The character of a predefined entity (XML 1.0, 4.6), 0 for any other name.
std::uint32_t entityCharacter(std::string_view name) {
    using Entity = std::pair<std::string_view, char>;
    constexpr std::array<Entity, 5> kEntities{
        {{"lt", '<'}, {"gt", '>'}, {"amp", '&'}, {"quot", '"'}, {"apos", '\''}}};
    for (const Entity& entity : kEntities) {
        if (entity.first == name) {
            return static_cast<std::uint32_t>(entity.second);
        }
    }
    return 0;
}

// Takes the reference at `p`, writes what it stands for to `out` and returns where it ends.
const char* decodeReference(const char* p, const char* end, char*& out) {
    const char* const begin = p + 1;
    const char* const semicolon =
        static_cast<const char*>(std::memchr(begin, ';', static_cast<std::size_t>(end - begin)));
    if (semicolon == nullptr) {
        throw XmlTextFault{p, "\"&\" begins no reference; expected \"&amp;\""};
    }
    const std::string_view name(begin, static_cast<std::size_t>(semicolon - begin));
    const bool isNumber = name.starts_with('#');
    const std::uint32_t code =
        isNumber ? parseCharacterNumber(name.substr(1)) : entityCharacter(name);
    if (code == 0) {
        throw XmlTextFault{p, isNumber ? "reference " + quotedForMessage(name) +
                                             " names no character that XML allows"
                                       : "entity " + quotedForMessage(name) + " is not defined"};
    }
    out = utf8::put(out, code);
    return semicolon + 1;
}

}  // namespace

char* decodeXmlText(char* begin, const char* end, XmlTextKind kind) {
    char* out = begin;
    const char* p = begin;
    while (p != end) {
        if (*p == '&' && kind != XmlTextKind::CData) {
            p = decodeReference(p, end, out);
            continue;
        }
        if (kind == XmlTextKind::Content) {
            const char* const run = p;
            while (p != end && *p != '&' && *p != '\r') {
                ++p;
            }
            if (p != run) {
                std::memmove(out, run, static_cast<std::size_t>(p - run));
                out += p - run;
                continue;
            }
        }
        char c = *p++;
        if (c == '\r') {
            c = '\n';
            p += p != end && *p == '\n' ? 1 : 0;
        }
        *out++ = kind == XmlTextKind::Attribute && isXmlSpace(c) ? ' ' : c;
    }
    return out;
}

}  // namespace Pegasus
