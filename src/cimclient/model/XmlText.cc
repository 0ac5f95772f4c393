#include "XmlText.h"

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

void appendAscii(std::string& xml, char c) {
    const std::string_view escape = escapeOf(static_cast<char32_t>(c));
    if (escape.empty()) {
        xml += c;
    } else {
        xml += escape;
    }
}

void appendCharacter(std::string& xml, char32_t code) {
    const bool isNonCharacter = code == 0xFFFE || code == 0xFFFF;
    utf8::append(xml, isNonCharacter ? kReplacement : code);
}

}  // namespace

void appendEscaped(std::string& xml, const String& text) {
    const Char16* units = text.getChar16Data();
    const Uint32 size = text.size();
    for (Uint32 i = 0; i < size; ++i) {
        const Uint16 unit = units[i];
        if (unit < 0x80) {
            appendAscii(xml, static_cast<char>(unit));
        } else if (utf8::isHighSurrogate(unit) && i + 1 < size &&
                   utf8::isLowSurrogate(units[i + 1])) {
            ++i;
            appendCharacter(xml, utf8::joinSurrogates(unit, units[i]));
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
