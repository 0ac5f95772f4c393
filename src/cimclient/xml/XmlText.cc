#include "xml/XmlText.h"

#include <cstdint>

#include "utf8/Utf8.h"
#include "xml/XmlCharacters.h"

namespace Pegasus {

namespace {

constexpr std::uint32_t kReplacement = 0xFFFD;

constexpr bool isHighSurrogate(Uint16 unit) {
    return unit >= 0xD800 && unit <= 0xDBFF;
}
constexpr bool isLowSurrogate(Uint16 unit) {
    return unit >= 0xDC00 && unit <= 0xDFFF;
}

// What stands in XML for an ASCII character; empty when the character stands for itself.
std::string_view escapeOf(std::uint32_t code) {
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

void appendAscii(std::string& xml, char c) {
    const std::string_view escape = escapeOf(static_cast<std::uint32_t>(c));
    if (escape.empty()) {
        xml += c;
    } else {
        xml += escape;
    }
}

void appendCharacter(std::string& xml, std::uint32_t code) {
    utf8::append(xml, isReferable(code) ? code : kReplacement);
}

}  // namespace

void appendEscaped(std::string& xml, const String& text) {
    const Char16* units = text.getChar16Data();
    const Uint32 size = text.size();
    for (Uint32 i = 0; i < size; ++i) {
        const Uint16 unit = units[i];
        if (unit < 0x80) {
            appendAscii(xml, static_cast<char>(unit));
        } else if (isHighSurrogate(unit) && i + 1 < size && isLowSurrogate(units[i + 1])) {
            ++i;
            appendCharacter(xml, 0x10000 + ((unit - 0xD800U) << 10U) + (units[i] - 0xDC00U));
        } else {
            appendCharacter(xml, unit);
        }
    }
}

void appendEscaped(std::string& xml, std::string_view utf8) {
    for (const char c : utf8) {
        if (static_cast<unsigned char>(c) < 0x80) {
            appendAscii(xml, c);
        } else {
            xml += c;
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
