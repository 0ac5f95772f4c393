#include "script/NameFaults.h"

#include <algorithm>
#include <optional>
#include <string_view>

#include "mifreader/Error.h"
#include "mifreader/Lexer.h"
#include "script/ScriptText.h"

namespace sennetctl {

namespace {

bool isBeyondAscii(char c) {
    return static_cast<unsigned char>(c) > 0x7F;
}

bool breaksLiteral(const std::string& text) {
    return std::any_of(text.begin(), text.end(), [](char c) {
        return c == '"' || static_cast<unsigned char>(c) < 0x20 || c == 0x7F;
    });
}

/// What a reader makes of the text between quotes; none when it refuses that.
std::optional<std::string> readText(const std::string& text, Mif::Tolerances tolerances) {
    const std::string literal = '"' + text + '"';
    try {
        return Mif::Lexer(literal, tolerances).next().text;
    } catch (const Mif::Error&) {
        return std::nullopt;
    }
}

void addEscapes(const std::string& text, std::vector<NameFault>& faults) {
    std::string ascii = text;
    std::replace_if(ascii.begin(), ascii.end(), isBeyondAscii, '?');
    const std::optional<std::string> strict = readText(ascii, {});
    if (!strict) {
        const bool fineForCa = readText(ascii, {Mif::Tolerance::PlainBackslashes}).has_value();
        faults.push_back({Severity::Error,
                          " has a backslash, which begins an escape: the MIF file cannot be read" +
                              std::string(fineForCa ? " but by CA" : "")});
    } else if (*strict != ascii) {
        faults.push_back({Severity::Warning,
                          " has a backslash, which begins an escape: other characters arrive"});
    }
}

/// Besides those that all databases take in a name, and those of which something else is told.
bool isOddInSql(char c) {
    const bool isNamed = (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') ||
                         (c >= '0' && c <= '9') || c == '_' || c == ' ';
    return c > 0x20 && c < 0x7F && !isNamed &&
           std::string_view("\"\\$`").find(c) == std::string_view::npos;
}

bool isReserved(std::string_view name) {
    return sameIgnoringCase(name, "Identification") || sameIgnoringCase(name, "Architecture");
}

NameFault reservedFault() {
    return {Severity::Error,
            " is one of Configuration Manager's own: for SMS the file would alter the machine's "
            "own record"};
}

}  // namespace

std::vector<NameFault> literalFaults(const std::string& text) {
    std::vector<NameFault> faults;
    if (breaksLiteral(text)) {
        faults.push_back(
            {Severity::Error,
             " has a double quote or a control character: the MIF file cannot be read"});
    } else if (text.find('\\') != std::string::npos) {
        addEscapes(text, faults);
    }
    if (std::any_of(text.begin(), text.end(), isBeyondAscii)) {
        faults.push_back({Severity::Error,
                          " has letters beyond ASCII: other characters arrive, or readers "
                          "refuse the MIF file"});
    }
    return faults;
}

std::vector<NameFault> groupNameFaults(const std::string& name) {
    std::vector<NameFault> faults = literalFaults(name);
    if (isReserved(name)) {
        faults.push_back(reservedFault());
    }
    return faults;
}

std::vector<NameFault> classFaults(const std::string& title) {
    std::vector<NameFault> faults;
    // Before the first bar a prefix makes the part another one.
    std::size_t bar = title.find('|');
    if (bar != std::string::npos) {
        faults.push_back({Severity::Warning,
                          " has a '|': the MIF class is then not of the form body|name|version"});
    }
    while (bar != std::string::npos) {
        const std::size_t next = title.find('|', bar + 1);
        if (isReserved(std::string_view(title).substr(bar + 1, next - bar - 1))) {
            faults.push_back(reservedFault());
            break;
        }
        bar = next;
    }
    return faults;
}

std::vector<NameFault> shellTextFaults(const std::string& text) {
    if (text.find_first_of("$`") == std::string::npos) {
        return {};
    }
    return {{Severity::Error,
             " has a '$' or a backquote: the shell replaces it in QVE's query script, or runs it"}};
}

std::vector<NameFault> sqlNameFaults(const std::string& name) {
    std::vector<NameFault> faults = shellTextFaults(name);
    if (std::any_of(name.begin(), name.end(), isOddInSql)) {
        faults.push_back({Severity::Warning,
                          " has characters besides letters, digits and blanks: databases or shells "
                          "refuse it in QVE's scripts, where it has no quotes"});
    }
    return faults;
}

}  // namespace sennetctl
