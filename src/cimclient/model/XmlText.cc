#include "XmlText.h"

#include <algorithm>

#include "utf8/Utf8.h"

namespace Pegasus {

namespace {

constexpr char32_t kReplacement = 0xFFFD;

// What stands in XML for an ASCII character; empty when the character stands for itself.
std::string_view escapeOf(char32_t code) {
    switch (code) {
        case '&':
            return "&amp;";
        case '<':
            return "&lt;";
        case '>':
            return "&gt;";
        case '"':
            return "&quot;";
        case '\'':
            return "&apos;";
        case '\t':
            return "&#9;";
        case '\n':
            return "&#10;";
        case '\r':
            return "&#13;";
        default:
            return code < 0x20 ? "\xEF\xBF\xBD" : "";
    }
}

// U+FFFE and U+FFFF in UTF-8 begin with this byte and one more.
constexpr Uint8 kNonCharacterLead = 0xEF;
constexpr std::size_t kNonCharacterLength = 3;

constexpr bool beginsWithNonCharacter(std::string_view utf8) {
    return utf8.substr(0, kNonCharacterLength) == "\xEF\xBF\xBE" ||
           utf8.substr(0, kNonCharacterLength) == "\xEF\xBF\xBF";
}

/// What may not stand for itself; of 16-bit codes also all that are not ASCII.
template <class Code>
constexpr bool isSpecial(Code code) {
    const bool isWide = sizeof(Code) > 1 ? code >= 0x80 : code == kNonCharacterLead;
    return isWide || code < 0x20 || code == '"' || code == '&' || code == '\'' || code == '<' ||
           code == '>';
}

/// How many units at the front are not special. In blocks, of which the compiler makes few
/// instructions: most texts have nothing special in them.
template <class Code, class Unit>
std::size_t plainLength(const Unit* text, std::size_t n) {
    constexpr std::size_t kBlock = 16;
    std::size_t i = 0;
    for (; n - i >= kBlock; i += kBlock) {
        Code special = 0;
        for (std::size_t k = 0; k < kBlock; ++k) {
            special |= static_cast<Code>(isSpecial(static_cast<Code>(text[i + k])));
        }
        if (special != 0) {
            break;
        }
    }
    while (i < n && !isSpecial(static_cast<Code>(text[i]))) {
        ++i;
    }
    return i;
}

void appendCharacter(std::string& xml, char32_t code) {
    const std::string_view escape = code < 0x80 ? escapeOf(code) : std::string_view();
    const bool isNonCharacter = code == 0xFFFE || code == 0xFFFF;
    if (escape.empty()) {
        utf8::append(xml, isNonCharacter ? kReplacement : code);
    } else {
        xml += escape;
    }
}

void appendNarrowed(std::string& xml, const Char16* ascii, std::size_t n) {
    const std::size_t before = xml.size();
    xml.resize(before + n);
    std::transform(ascii, ascii + n, xml.data() + before,
                   [](Char16 unit) { return static_cast<char>(Uint16{unit}); });
}

}  // namespace

void appendEscaped(std::string& xml, const String& text) {
    const Char16* units = text.getChar16Data();
    const Char16* const end = units + text.size();
    while (true) {
        const std::size_t plain = plainLength<Uint16>(units, static_cast<std::size_t>(end - units));
        appendNarrowed(xml, units, plain);
        units += plain;
        if (units == end) {
            break;
        }
        char32_t code = Uint16{*units++};
        if (utf8::isHighSurrogate(code) && units != end && utf8::isLowSurrogate(*units)) {
            code = utf8::joinSurrogates(code, *units++);
        }
        appendCharacter(xml, code);
    }
}

void appendEscaped(std::string& xml, std::string_view utf8) {
    while (true) {
        const std::size_t plain = plainLength<Uint8>(utf8.data(), utf8.size());
        xml.append(utf8.substr(0, plain));
        if (plain == utf8.size()) {
            break;
        }
        utf8.remove_prefix(plain);
        const auto byte = static_cast<Uint8>(utf8[0]);
        if (byte < 0x80) {
            appendCharacter(xml, byte);
            utf8.remove_prefix(1);
        } else if (beginsWithNonCharacter(utf8)) {
            appendCharacter(xml, kReplacement);
            utf8.remove_prefix(kNonCharacterLength);
        } else {
            xml += utf8[0];
            utf8.remove_prefix(1);
        }
    }
}

void appendAttribute(std::string& xml, std::string_view name, const String& value) {
    xml.append(" ").append(name).append("=\"");
    appendEscaped(xml, value);
    xml += '"';
}

void appendAttribute(std::string& xml, std::string_view name, std::string_view utf8) {
    xml.append(" ").append(name).append("=\"");
    appendEscaped(xml, utf8);
    xml += '"';
}

}  // namespace Pegasus
