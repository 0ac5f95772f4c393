#pragma once

// How the generator takes the lines of a script apart.

#include <string>
#include <string_view>
#include <vector>

namespace sennetctl {

/// CimScriptParser::parseTokens for UTF-8, which the text must be.
std::vector<std::string> scriptTokens(const std::string& text, const char* separators);

/// Without blanks and tabs at both ends.
std::string trimmed(std::string_view text);

/// Whether the texts are the same but for the case of ASCII letters.
bool sameIgnoringCase(std::string_view one, std::string_view other);

/// With the case of ASCII letters taken away.
std::string inSmallLetters(std::string text);

/// What the names of inventory scripts end in, in any case.
constexpr std::string_view kScriptSuffix = ".script.inv";
bool isCalledScript(std::string_view path);

/// The key of the resource properties under which the generator looks a title up.
std::string titleKey(std::string title);

/// Whether somebody means an entry of the section [CIM], or of the section [DEFAULT].
bool looksLikeCimEntry(std::string_view line);
bool looksLikeDefaultEntry(std::string_view line);

bool isLegalName(const std::string& text);
bool isLegalNamespace(const std::string& text);

}  // namespace sennetctl
