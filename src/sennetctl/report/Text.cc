#include "report/Text.h"

#include "utf8/Utf8.h"

namespace sennetctl {

std::string printable(std::string_view text) {
    const std::string clean = utf8::clean(text);
    std::string shown;
    shown.reserve(clean.size());
    for (std::size_t i = 0; i < clean.size(); ++i) {
        const auto code = static_cast<unsigned char>(clean[i]);
        if (code < ' ' || code == 0x7F) {
            shown += ' ';
        } else if (code == 0xC2 && static_cast<unsigned char>(clean[i + 1]) < 0xA0) {
            // The second set of control characters, U+0080 to U+009F, moves the cursor, too.
            shown += ' ';
            ++i;
        } else {
            shown += clean[i];
        }
    }
    return shown;
}

std::size_t widthOf(std::string_view text) {
    std::size_t width = 0;
    for (const char c : text) {
        width += utf8::isContinuation(c) ? 0 : 1;
    }
    return width;
}

std::string shortened(std::string_view text, std::size_t width) {
    if (width == 0 || widthOf(text) <= width) {
        return std::string(text);
    }
    std::size_t end = 0;
    for (std::size_t characters = 0; characters + 1 < width; ++characters) {
        end += utf8::characterLength(text.substr(end));
    }
    return std::string(text.substr(0, end)) + "…";
}

std::string fromLatin1(std::string_view octets) {
    std::string text;
    for (const char c : octets) {
        utf8::append(text, static_cast<unsigned char>(c));
    }
    return text;
}

std::string counted(std::size_t count, std::string_view noun) {
    std::string text = std::to_string(count) + " ";
    text += noun;
    return count == 1 ? text : text + "s";
}

}  // namespace sennetctl
