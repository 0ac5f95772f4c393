#include "script/ColumnNames.h"

#include <algorithm>

#include "SennetConverter/framework/NameRules.h"
#include "SennetConverter/framework/SennetUtilities.h"
#include "report/Text.h"
#include "script/FixedColumns.h"
#include "script/ScriptText.h"
#include "utf8/Utf8.h"

namespace sennetctl {

using Pegasus::SennetUtilities;
using Pegasus::String;

namespace {

using Pegasus::kLongestLumoName;
using Pegasus::kLongestName;

bool isCapital(char c) {
    return c >= 'A' && c <= 'Z';
}

String inLumo(const std::string& name) {
    return SennetUtilities::substituteValues(
        SennetUtilities::formatPropertyName4quvelle(String(name.c_str()), kLongestLumoName));
}

std::vector<std::string> wordsOf(const std::string& text) {
    std::vector<std::string> words;
    for (std::size_t begin = 0; begin < text.size();) {
        const std::size_t end = std::min(text.find(' ', begin), text.size());
        if (end > begin) {
            words.push_back(text.substr(begin, end - begin));
        }
        begin = end + 1;
    }
    return words;
}

/// No half character stays.
void dropLastCharacter(std::string& text) {
    while (!text.empty() && utf8::isContinuation(text.back())) {
        text.pop_back();
    }
    if (!text.empty()) {
        text.pop_back();
    }
}

std::string joined(const std::vector<std::string>& words) {
    std::string text;
    for (const std::string& word : words) {
        text += (text.empty() || word.empty() ? "" : " ") + word;
    }
    return text;
}

}  // namespace

bool ColumnNames::isFree(const std::string& name) const {
    const String written = inLumo(name);
    const String inQve =
        SennetUtilities::formatPropertyName4quvelle(String(name.c_str()), kLongestName);
    return !sameIgnoringCase(name, "Index") && !isQveColumn(inQve) && !isLumoColumn(written) &&
           !isSqlWord(inQve) && std::none_of(taken.begin(), taken.end(), [&](const String& other) {
               return String::equalNoCase(other, written);
           });
}

bool ColumnNames::take(const std::string& name) {
    const bool free = isFree(name);
    taken.push_back(inLumo(name));
    return free;
}

std::string ColumnNames::choose(const std::string& readable) {
    std::string name = withShorterWords(readable, kLongestLumoName);
    for (unsigned number = 2; !isFree(name); ++number) {
        const std::string suffix = " " + std::to_string(number);
        name = withShorterWords(readable, kLongestLumoName - suffix.size()) + suffix;
    }
    taken.push_back(inLumo(name));
    return name;
}

std::string readableName(const std::string& name) {
    std::string text;
    for (std::size_t i = 0; i < name.size(); ++i) {
        const bool afterSmall = i > 0 && !isCapital(name[i - 1]);
        const bool beforeSmall =
            i > 0 && i + 1 < name.size() && name[i + 1] >= 'a' && name[i + 1] <= 'z';
        if (isCapital(name[i]) && (afterSmall || beforeSmall)) {
            text += ' ';
        }
        text += name[i] == '_' ? ' ' : name[i];
    }
    if (!text.empty() && text[0] >= 'a' && text[0] <= 'z') {
        text[0] = static_cast<char>(text[0] - 'a' + 'A');
    }
    return text;
}

std::string withShorterWords(const std::string& text, std::size_t limit) {
    std::vector<std::string> words = wordsOf(text);
    while (joined(words).size() > limit) {
        dropLastCharacter(*std::max_element(words.rbegin(), words.rend(),
                                            [](const std::string& one, const std::string& other) {
                                                return one.size() < other.size();
                                            }));
    }
    return joined(words);
}

}  // namespace sennetctl
