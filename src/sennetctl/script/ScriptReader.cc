#include "script/ScriptReader.h"

#include <algorithm>
#include <cstdlib>
#include <utility>

#include "report/Text.h"
#include "script/ScriptText.h"
#include "utf8/Utf8.h"

namespace sennetctl {

namespace {

constexpr std::size_t kLineLimit = 1024;
constexpr const char* kGivenUp = ": sennet gives the whole script up";

bool isComment(std::string_view line) {
    const std::string text = trimmed(line);
    return text.empty() || text[0] == '#' || text[0] == ';' || text[0] == '!' ||
           text.substr(0, 2) == "//";
}

bool isDecimal(const std::string& text) {
    return !text.empty() && text.find_first_not_of("0123456789") == std::string::npos;
}

std::string quoted(const std::string& text) {
    return "'" + text + "'";
}

/// Counted from 1.
std::size_t columnOf(const std::string& line, const std::string& value) {
    const std::size_t separator = line.find('=');
    const std::size_t begin = line.find(value, separator == std::string::npos ? 0 : separator);
    return begin == std::string::npos ? 1 : begin + 1;
}

/// The entry of a letter, and what it is called.
std::pair<ScriptText*, const char*> entryOf(char letter, ScriptSlot& slot) {
    if (letter == 'G' || letter == 'g') {
        return {&slot.className, "class"};
    }
    if (letter == 'N' || letter == 'n') {
        return {&slot.nameSpace, "namespace"};
    }
    return {&slot.propertyList, "properties"};
}

bool isLetter(const std::string& text) {
    return text.size() == 1 && std::string_view("GgNnAa").find(text[0]) != std::string_view::npos;
}

}  // namespace

ScriptReader::ScriptReader(const std::string& file, std::vector<Finding>& theFindings)
    : findings(theFindings) {
    model.file = file;
}

ScriptModel ScriptReader::read(std::string_view octets) {
    lineNumber = 1;
    if (octets.substr(0, 2) == "\xFE\xFF" || octets.substr(0, 2) == "\xFF\xFE") {
        add(Severity::Error, "UTF-16, of which sennet understands nothing: save it as UTF-8");
        model.givenUp = true;
        return model;
    }
    if (octets.find('\n') == std::string_view::npos &&
        octets.substr(0, octets.size() - 1).find('\r') != std::string_view::npos) {
        add(Severity::Error,
            "lines that end in carriage returns alone, so that sennet sees one line and no entry: "
            "end them with line feeds");
        model.givenUp = true;
        return model;
    }
    for (std::size_t begin = 0; begin < octets.size(); ++lineNumber) {
        const std::size_t end = std::min(octets.find('\n', begin), octets.size());
        std::string_view line = octets.substr(begin, end - begin);
        if (!line.empty() && line.back() == '\r' && end < octets.size()) {
            line.remove_suffix(1);
        }
        readLine(line);
        begin = end + 1;
    }
    tellEntries();
    return model;
}

void ScriptReader::readLine(std::string_view line) {
    if (line.size() > kLineLimit) {
        add(Severity::Warning,
            "line of " + std::to_string(line.size()) + " octets: only the first 1024 are read",
            kLineLimit + 1);
        line = line.substr(0, kLineLimit);
    }
    if (const std::size_t nul = line.find('\0'); nul != std::string_view::npos) {
        add(Severity::Warning, "NUL, at which the line ends for sennet", nul + 1);
        line = line.substr(0, nul);
    }
    if (line.empty() || !isReadable(line)) {
        return;
    }
    if (line == "[DEFAULT]" || line == "[CIM]") {
        section = line == "[CIM]" ? Section::Cim : Section::Default;
        isHeaderLost = false;
    } else if (isComment(line)) {
        return;
    } else if (trimmed(line).front() == '[' || line.substr(0, 3) == "\xEF\xBB\xBF") {
        readHeader(line);
    } else if (section == Section::Default) {
        readDefault(std::string(line));
    } else if (section == Section::Cim) {
        readCim(std::string(line));
    } else {
        addWithoutEffect("it stands before the first section");
    }
}

bool ScriptReader::isReadable(std::string_view line) {
    for (std::size_t i = 0; i < line.size();) {
        const std::size_t length = utf8::characterLength(line.substr(i));
        if (length == 0) {
            add(Severity::Error, std::string("octets that are not UTF-8") + kGivenUp, i + 1);
            model.givenUp = true;
            return false;
        }
        i += length;
    }
    return true;
}

// A line that is meant to be a header and is none.
void ScriptReader::readHeader(std::string_view line) {
    if (line.substr(0, 3) == "\xEF\xBB\xBF") {
        add(Severity::Error,
            "byte-order mark, which hides this line from sennet: save the file without it");
        isHeaderLost = trimmed(line.substr(3)).substr(0, 1) == "[";
        return;
    }
    const std::string text = trimmed(line);
    for (const char* header : {"[DEFAULT]", "[CIM]"}) {
        if (sameIgnoringCase(text, header)) {
            add(Severity::Warning, "line without effect: the header has to be exactly " +
                                       std::string(header) + ", in capitals and without blanks");
            isHeaderLost = true;
            return;
        }
    }
    add(Severity::Warning,
        "line without effect: there are the sections [DEFAULT] and [CIM] only, "
        "and the one before goes on");
}

void ScriptReader::readDefault(const std::string& line) {
    const std::vector<std::string> tokens = scriptTokens(line, "\t=");
    const std::string key = tokens.empty() ? "" : tokens[0];
    if (looksLikeCimEntry(line)) {
        addWithoutEffect("entries of classes belong below [CIM]");
        return;
    }
    if (tokens.size() < 2) {
        add(Severity::Warning, looksLikeDefaultEntry(line)
                                   ? "line without effect: it has no value"
                                   : "line without effect: an entry is key=value");
        return;
    }
    const bool isTitle = sameIgnoringCase(key, "title");
    if (!isTitle && !sameIgnoringCase(key, "defaultnamespace")) {
        const std::string meant = trimmed(key);
        const bool blanks = meant != key && looksLikeDefaultEntry(meant);
        add(Severity::Warning,
            blanks ? "line without effect: blanks around '=' belong to key and value; write " +
                         meant + "=" + trimmed(tokens[1])
                   : "line without effect: unknown key " + quoted(key) +
                         "; there are title and defaultnamespace");
        return;
    }
    ScriptText& entry = isTitle ? model.title : model.defaultNamespace;
    store(entry, line, tokens[1], isTitle ? "title" : "namespace");
    if (tokens.size() > 2) {
        addToEntry(entry, Severity::Warning,
                   "only " + quoted(tokens[1]) + " is taken: a second '=' or a tab ends the value");
    }
    if (isTitle && trimmed(tokens[1]) != tokens[1]) {
        addToEntry(entry, Severity::Warning,
                   "the title " + quoted(tokens[1]) + " begins or ends with a blank", entry.column);
    }
}

void ScriptReader::readCim(const std::string& line) {
    const std::vector<std::string> tokens = scriptTokens(line, "\t[]=");
    if (tokens.size() < 3 || !isLetter(tokens[0]) ||
        std::strtol(tokens[1].c_str(), nullptr, 10) < 0) {
        explainCim(line, tokens);
    } else {
        storeCim(line, tokens);
    }
}

void ScriptReader::explainCim(const std::string& line, const std::vector<std::string>& tokens) {
    if (looksLikeDefaultEntry(line)) {
        addWithoutEffect("title and defaultnamespace belong below [DEFAULT]");
        return;
    }
    const std::string letter = tokens.empty() ? "" : tokens[0];
    std::string reason = "an entry is G[n]=class, N[n]=namespace or A[n]=properties";
    if (isLetter(letter) && tokens.size() < 3) {
        reason = "it has no value";
    } else if (isLetter(letter)) {
        reason = "the slot number is negative; slots are 0 to 9";
    } else if (isLetter(trimmed(letter)) && tokens.size() >= 3) {
        reason = "blanks beside the letter; write " + trimmed(letter) + "[" + trimmed(tokens[1]) +
                 "]=" + trimmed(tokens.back());
    } else if (tokens.size() >= 3) {
        reason = "unknown letter " + quoted(letter) + "; " + reason;
    }
    add(Severity::Warning, "line without effect: " + reason);
}

void ScriptReader::storeCim(const std::string& line, const std::vector<std::string>& tokens) {
    const long slot = std::strtol(tokens[1].c_str(), nullptr, 10);
    if (slot >= static_cast<long>(ScriptModel::kSlots)) {
        add(Severity::Error, "slot " + std::to_string(slot) + ", while slots are 0 to 9" + kGivenUp,
            3);
        model.givenUp = true;
        return;
    }
    if (!isDecimal(tokens[1])) {
        add(Severity::Warning,
            "slot number " + quoted(tokens[1]) + " is read as " + std::to_string(slot), 3);
    }
    const auto [entry, kind] = entryOf(tokens[0][0], model.slots[static_cast<std::size_t>(slot)]);
    store(*entry, line, tokens[2], kind + std::string(" of slot ") + std::to_string(slot));
    if (trimmed(tokens[2]).empty()) {
        tellBlank(*entry, tokens);
    } else if (tokens.size() > 3) {
        addToEntry(*entry, Severity::Warning,
                   "only " + quoted(tokens[2]) +
                       " is taken: a bracket, a second '=' or a tab ends the value");
    }
}

// A blank is no name; of properties it is an empty list.
void ScriptReader::tellBlank(const ScriptText& entry, const std::vector<std::string>& tokens) {
    const bool isList = tokens[0] == "A" || tokens[0] == "a";
    const std::string meant = trimmed(tokens.back());
    addToEntry(entry, Severity::Error,
               std::string("blanks around '=' are taken for the value") + (isList ? "" : kGivenUp) +
                   (meant.empty() ? std::string()
                                  : "; write " + tokens[0] + "[" + tokens[1] + "]=" + meant));
}

void ScriptReader::store(ScriptText& text, const std::string& line, const std::string& value,
                         const std::string& what) {
    if (text.line > 0) {
        add(Severity::Warning, "replaces the " + what + " of line " + std::to_string(text.line));
    }
    text = {value, lineNumber, static_cast<unsigned>(columnOf(line, value))};
    entryFindings[&text].clear();
}

void ScriptReader::tellEntries() {
    for (const auto& [entry, found] : entryFindings) {
        findings.insert(findings.end(), found.begin(), found.end());
    }
}

void ScriptReader::addToEntry(const ScriptText& entry, Severity severity,
                              const std::string& message, std::size_t column) {
    entryFindings[&entry].push_back(
        {model.file, lineNumber, static_cast<unsigned>(column), severity, message});
}

// Below a header that is none, the header is the fault.
void ScriptReader::addWithoutEffect(const std::string& reason) {
    if (!isHeaderLost) {
        add(Severity::Warning, "line without effect: " + reason);
    }
}

void ScriptReader::add(Severity severity, const std::string& message, std::size_t column) {
    findings.push_back({model.file, lineNumber, static_cast<unsigned>(column), severity, message});
}

}  // namespace sennetctl
