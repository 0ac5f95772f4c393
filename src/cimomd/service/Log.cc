#include "service/Log.h"

#include <fmt/format.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <string>

namespace cimomd {
namespace {

std::string printable(std::string_view text) {
    std::string clean(text);
    const auto isControl = [](char c) {
        return static_cast<unsigned char>(c) < ' ' || c == '\x7F';
    };
    std::replace_if(clean.begin(), clean.end(), isControl, '?');
    return clean;
}

}  // namespace

void logText(LogLevel level, std::string_view text) {
    const bool toJournal = std::getenv("JOURNAL_STREAM") != nullptr;
    const std::string prefix = toJournal ? fmt::format("<{}>", static_cast<int>(level)) : "";
    std::string out;
    while (!text.empty()) {
        const std::size_t end = std::min(text.find('\n'), text.size());
        out += fmt::format("{}cimomd: {}\n", prefix, printable(text.substr(0, end)));
        text.remove_prefix(std::min(end + 1, text.size()));
    }
    std::fwrite(out.data(), 1, out.size(), stderr);
}

}  // namespace cimomd
