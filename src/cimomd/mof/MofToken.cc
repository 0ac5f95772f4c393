#include "mof/MofToken.h"

#include "text/Utf8.h"

namespace cimomd {
namespace {

constexpr std::size_t kMaxShownText = 40;

}  // namespace

std::string shownText(std::string_view text) {
    if (text.size() > kMaxShownText)
        return cleanText(text.substr(0, kMaxShownText)) + "...";
    return cleanText(text);
}

std::string quotedText(std::string_view text) {
    const bool isQuoted = !text.empty() && (text.front() == '"' || text.front() == '\'');
    return isQuoted ? shownText(text) : "'" + shownText(text) + "'";
}

}  // namespace cimomd
