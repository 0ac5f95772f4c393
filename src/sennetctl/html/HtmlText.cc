#include "html/HtmlText.h"

#include <fmt/format.h>

#include <algorithm>
#include <optional>

#include "report/Text.h"

namespace sennetctl {

namespace {

std::string_view escapeOf(char c) {
    switch (c) {
        case '&':
            return "&amp;";
        case '<':
            return "&lt;";
        case '>':
            return "&gt;";
        case '"':
            return "&quot;";
        case '\'':
            return "&#39;";
        default:
            return {};
    }
}

void appendLine(std::string& html, std::string_view line) {
    for (const char c : printable(line)) {
        const std::string_view escape = escapeOf(c);
        if (escape.empty()) {
            html += c;
        } else {
            html += escape;
        }
    }
}

/// "+01:30" of the minutes "+090", a sign and three digits.
std::string offsetOf(std::string_view text) {
    const int minutes = (text[1] - '0') * 100 + (text[2] - '0') * 10 + (text[3] - '0');
    return fmt::format("{}{:02}:{:02}", text[0], minutes / 60, minutes % 60);
}

/// The parts of a moment; none for texts of another form and for moments with unknown fields.
struct Moment {
    std::string date;
    std::string time;
    std::string offset;
};

std::optional<Moment> momentIn(std::string_view text) {
    constexpr std::string_view kForm = "00000000000000.000000+000";
    if (text.size() != kForm.size()) {
        return std::nullopt;
    }
    for (std::size_t i = 0; i < text.size(); ++i) {
        const bool digit = text[i] >= '0' && text[i] <= '9';
        const bool sign = kForm[i] == '+' && text[i] == '-';
        if (kForm[i] == '0' ? !digit : text[i] != kForm[i] && !sign) {
            return std::nullopt;
        }
    }
    return Moment{
        fmt::format("{}-{}-{}", text.substr(0, 4), text.substr(4, 2), text.substr(6, 2)),
        fmt::format("{}:{}:{}", text.substr(8, 2), text.substr(10, 2), text.substr(12, 2)),
        offsetOf(text.substr(21))};
}

}  // namespace

void appendHtml(std::string& html, std::string_view text) {
    while (!text.empty()) {
        const std::size_t end = std::min(text.find_first_of("\r\n"), text.size());
        appendLine(html, text.substr(0, end));
        const std::size_t lineEnd = text.substr(end, 2) == "\r\n" ? 2 : 1;
        if (end < text.size()) {
            html += '\n';
        }
        text.remove_prefix(std::min(end + lineEnd, text.size()));
    }
}

void appendHtmlValue(std::string& html, std::string_view text) {
    const std::optional<Moment> moment = momentIn(text);
    if (!moment) {
        appendHtml(html, text);
        return;
    }
    html +=
        fmt::format("<time datetime=\"{0}T{1}{2}\">{0} {1} {3}</time>", moment->date, moment->time,
                    moment->offset, moment->offset == "+00:00" ? "UTC" : moment->offset);
}

}  // namespace sennetctl
