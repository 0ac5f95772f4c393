#include "service/Log.h"

#include <fmt/format.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <string>

namespace cimomd {

void logLine(LogLevel level, std::string_view text) {
    std::string clean(text);
    const auto isControl = [](char c) {
        return static_cast<unsigned char>(c) < ' ' || c == '\x7F';
    };
    std::replace_if(clean.begin(), clean.end(), isControl, '?');
    const bool toJournal = std::getenv("JOURNAL_STREAM") != nullptr;
    const std::string prefix = toJournal ? fmt::format("<{}>", static_cast<int>(level)) : "";
    const std::string line = fmt::format("{}cimomd: {}\n", prefix, clean);
    std::fwrite(line.data(), 1, line.size(), stderr);
}

}  // namespace cimomd
