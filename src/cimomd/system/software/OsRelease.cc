#include "system/software/OsRelease.h"

#include "files/TextFields.h"
#include "files/TextFile.h"

namespace cimomd {
namespace {

/// Undoes the quoting a shell would: '...' is literal, a backslash elsewhere keeps the next byte.
std::string unquoted(std::string_view value) {
    std::string out;
    char quote = '\0';
    for (std::size_t i = 0; i < value.size(); ++i) {
        const char c = value[i];
        if (c == quote) {
            quote = '\0';
        } else if (quote == '\0' && (c == '"' || c == '\'')) {
            quote = c;
        } else if (c == '\\' && quote != '\'' && i + 1 < value.size()) {
            out += value[++i];
        } else {
            out += c;
        }
    }
    return out;
}

}  // namespace

OsRelease parseOsRelease(std::string_view text) {
    OsRelease out;
    for (const std::string_view line : linesOf(text)) {
        const auto entry = keyValueOf(line, '=');
        if (!entry)
            continue;
        const std::string value = unquoted(entry->value);
        const std::optional<std::string> known =
            value.empty() ? std::nullopt : std::optional<std::string>(value);
        if (entry->key == "ID")
            out.id = known;
        else if (entry->key == "NAME")
            out.name = known;
        else if (entry->key == "PRETTY_NAME")
            out.prettyName = known;
        else if (entry->key == "VERSION_ID")
            out.versionId = known;
    }
    return out;
}

OsRelease readOsRelease(const SystemPaths& paths) {
    auto text = readText(paths.osRelease());
    if (!text)
        text = readText(paths.vendorOsRelease());
    return parseOsRelease(text.value_or(""));
}

std::string nameOf(const OsRelease& release) {
    return release.name.value_or("Linux");
}

}  // namespace cimomd
