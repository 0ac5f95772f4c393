#include "xml/MarkupRun.h"

#include <utility>

namespace Pegasus {

namespace {

constexpr std::size_t kMaxMarkup = 1024;
constexpr std::string_view kStartTag = "<VALUE>";
constexpr std::string_view kEndTag = "</VALUE>";
constexpr std::size_t kNone = std::string_view::npos;

bool holdsTagsAndTextsOnly(std::string_view element) {
    return element.find("<!") == kNone && element.find("<?") == kNone;
}

// VALUE elements in any spelling, VALUE.NULL among them.
int countValues(std::string_view markup) {
    constexpr std::string_view kAny = "<VALUE";
    int count = 0;
    for (std::size_t i = markup.find(kAny); i != kNone; i = markup.find(kAny, i + 1)) {
        count += markup.substr(i).starts_with("<VALUE.ARRAY") ? 0 : 1;
    }
    return count;
}

// One of them begins right before each text, and none stands elsewhere.
bool isRegular(const MarkupRun& run) {
    return countValues(run.before) == 1 && countValues(run.after) == 0 &&
           (run.between.empty() || countValues(run.between) == 1);
}

}  // namespace

std::optional<MarkupRun> MarkupRun::of(std::string_view element, bool hasText) {
    if (!holdsTagsAndTextsOnly(element)) {
        return std::nullopt;
    }
    MarkupRun run;
    run.hasText = hasText;
    if (!hasText) {
        run.before = element;
        return run.before.size() > kMaxMarkup ? std::nullopt : std::optional(run);
    }
    const std::size_t firstTag = element.find(kStartTag);
    const std::size_t lastEnd = element.rfind(kEndTag);
    if (firstTag == kNone || lastEnd == kNone) {
        return std::nullopt;
    }
    const std::size_t firstText = firstTag + kStartTag.size();
    const std::size_t firstEnd = element.find('<', firstText);
    const std::size_t secondTag = element.find(kStartTag, firstEnd);
    run.before = element.substr(0, firstText);
    run.after = element.substr(lastEnd);
    run.textTagSize = kStartTag.size();
    if (secondTag != kNone) {
        run.between = element.substr(firstEnd, secondTag + kStartTag.size() - firstEnd);
    }
    const bool isShort = run.before.size() + run.between.size() + run.after.size() <= kMaxMarkup;
    return isShort && isRegular(run) ? std::optional(std::move(run)) : std::nullopt;
}

std::optional<MarkupRun> MarkupRun::ofOneText(std::string_view element, std::string_view leaf) {
    const std::string start = "<" + std::string(leaf);
    const std::size_t tag = element.find(start);
    const std::size_t tagEnd = element.find('>', tag);
    if (!holdsTagsAndTextsOnly(element) || tagEnd == kNone || element[tagEnd - 1] == '/' ||
        element.find(start, tagEnd) != kNone) {
        return std::nullopt;
    }
    const std::size_t textEnd = element.find_first_of("<>", tagEnd + 1);
    // A ">" may stand in an attribute's value, too.
    if (textEnd == kNone || !element.substr(textEnd).starts_with("</" + std::string(leaf))) {
        return std::nullopt;
    }
    MarkupRun run;
    run.before = element.substr(0, tagEnd + 1);
    run.after = element.substr(textEnd);
    run.hasText = true;
    run.textTagSize = tagEnd + 1 - tag;
    return run.before.size() + run.after.size() <= kMaxMarkup ? std::optional(std::move(run))
                                                              : std::nullopt;
}

}  // namespace Pegasus
