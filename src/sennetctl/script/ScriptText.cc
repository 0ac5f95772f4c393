#include "script/ScriptText.h"

#include <Pegasus/Common/CIMName.h>

#include <algorithm>

#include "CimScriptParser/CimScriptParser.h"
#include "cim/CimText.h"

namespace sennetctl {

namespace {

char lower(char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

bool beginsWith(std::string_view text, std::string_view beginning) {
    return sameIgnoringCase(text.substr(0, beginning.size()), beginning);
}

}  // namespace

std::vector<std::string> scriptTokens(const std::string& text, const char* separators) {
    const Pegasus::Array<Pegasus::String> tokens =
        Pegasus::CimScriptParser::parseTokens(Pegasus::String(text.c_str()), separators);
    std::vector<std::string> texts;
    for (Pegasus::Uint32 i = 0; i < tokens.size(); ++i) {
        texts.push_back(textOf(tokens[i]));
    }
    return texts;
}

std::string trimmed(std::string_view text) {
    const std::size_t begin = text.find_first_not_of(" \t");
    if (begin == std::string_view::npos) {
        return {};
    }
    return std::string(text.substr(begin, text.find_last_not_of(" \t") - begin + 1));
}

bool sameIgnoringCase(std::string_view one, std::string_view other) {
    return std::equal(one.begin(), one.end(), other.begin(), other.end(),
                      [](char a, char b) { return lower(a) == lower(b); });
}

std::string inSmallLetters(std::string text) {
    std::transform(text.begin(), text.end(), text.begin(), lower);
    return text;
}

bool isCalledScript(std::string_view path) {
    return path.size() >= kScriptSuffix.size() &&
           sameIgnoringCase(path.substr(path.size() - kScriptSuffix.size()), kScriptSuffix);
}

std::string titleKey(std::string title) {
    std::replace(title.begin(), title.end(), ' ', '_');
    return "title." + title;
}

bool looksLikeCimEntry(std::string_view line) {
    const std::string text = trimmed(line);
    return text.size() > 1 && std::string_view("GgNnAa").find(text[0]) != std::string_view::npos &&
           trimmed(text.substr(1)).substr(0, 1) == "[";
}

bool looksLikeDefaultEntry(std::string_view line) {
    const std::string text = trimmed(line);
    return beginsWith(text, "title") || beginsWith(text, "defaultnamespace");
}

bool isLegalName(const std::string& text) {
    return Pegasus::CIMName::legal(Pegasus::String(text.c_str()));
}

bool isLegalNamespace(const std::string& text) {
    return Pegasus::CIMNamespaceName::legal(Pegasus::String(text.c_str()));
}

}  // namespace sennetctl
