#include "client/WireText.h"

#include <Pegasus/Common/Exception.h>

#include <algorithm>

namespace Pegasus {

namespace {

constexpr std::string_view kHexDigits = "0123456789ABCDEF";

char lowerCase(char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

bool isUnreserved(char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') || c == '-' ||
           c == '.' || c == '_' || c == '~';
}

// -1 for what is no hexadecimal digit.
int hexValue(char c) {
    if (c >= '0' && c <= '9') {
        return c - '0';
    }
    const char lower = lowerCase(c);
    return lower >= 'a' && lower <= 'f' ? lower - 'a' + 10 : -1;
}

bool isControl(char c) {
    const auto octet = static_cast<unsigned char>(c);
    return octet < 0x20 || octet == 0x7F;
}

}  // namespace

String printableText(std::string_view octets) {
    std::string text(octets);
    std::replace_if(text.begin(), text.end(), isControl, ' ');
    try {
        return String(text.c_str());
    } catch (const Exception&) {
        const auto isNotAscii = [](char c) { return static_cast<unsigned char>(c) > 0x7F; };
        std::replace_if(text.begin(), text.end(), isNotAscii, '?');
        return String(text.c_str());
    }
}

std::string percentEncoded(std::string_view octets) {
    std::string text;
    text.reserve(octets.size());
    for (const char c : octets) {
        if (isUnreserved(c)) {
            text += c;
        } else {
            const auto octet = static_cast<unsigned char>(c);
            text += '%';
            text += kHexDigits[octet >> 4];
            text += kHexDigits[octet & 0x0F];
        }
    }
    return text;
}

std::string percentDecoded(std::string_view text) {
    std::string octets;
    octets.reserve(text.size());
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (text[i] == '%' && text.size() - i > 2) {
            const int high = hexValue(text[i + 1]);
            const int low = hexValue(text[i + 2]);
            if (high >= 0 && low >= 0) {
                octets += static_cast<char>(high * 16 + low);
                i += 2;
                continue;
            }
        }
        octets += text[i];
    }
    return octets;
}

bool equalIgnoringCase(std::string_view a, std::string_view b) {
    return std::equal(a.begin(), a.end(), b.begin(), b.end(),
                      [](char x, char y) { return lowerCase(x) == lowerCase(y); });
}

std::string_view trimmed(std::string_view text) {
    const std::size_t first = text.find_first_not_of(" \t");
    if (first == std::string_view::npos) {
        return {};
    }
    return text.substr(first, text.find_last_not_of(" \t") - first + 1);
}

}  // namespace Pegasus
