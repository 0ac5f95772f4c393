#include "script/KeySpelling.h"

#include <map>
#include <optional>
#include <utility>

#include "properties/PropertiesEntries.h"
#include "script/NameCheck.h"
#include "script/ScriptText.h"

namespace sennetctl {

namespace {

constexpr std::string_view kTitle = "title.";
constexpr std::string_view kSize = ".Size";

bool beginsWith(std::string_view text, std::string_view beginning) {
    return text.substr(0, beginning.size()) == beginning;
}

bool endsWith(std::string_view text, std::string_view end) {
    return text.size() >= end.size() && text.substr(text.size() - end.size()) == end;
}

/// What is wrong with these parts is told of every key.
bool hasSameParts(std::string_view one, std::string_view other) {
    return beginsWith(one, kTitle) == beginsWith(other, kTitle) &&
           endsWith(one, kSize) == endsWith(other, kSize);
}

}  // namespace

KeySpelling::KeySpelling(std::string theFile, std::string_view octets) : file(std::move(theFile)) {
    Velm::PropertiesEntries entries(octets);
    while (const std::optional<Velm::PropertiesEntry> entry = entries.next()) {
        keys.insert_or_assign(entry->key, Place{entry->line, entry->keyColumn});
    }
}

void KeySpelling::look(const ScriptModel& model) {
    wanted.insert(titleKey(ownTitle(model)));
    for (const ScriptSlot& slot : model.slots) {
        if (slot.serverSpelling.empty()) {
            continue;
        }
        for (const ScriptText& property : slot.properties) {
            const std::string key = slot.serverSpelling + "." + property.value;
            wanted.insert(key);
            wanted.insert(key + std::string(kSize));
        }
    }
}

void KeySpelling::tell(bool areAll, std::vector<Finding>& findings) const {
    std::map<std::string, std::string> missing;
    for (const std::string& key : wanted) {
        if (keys.count(key) == 0) {
            missing.emplace(inSmallLetters(key), key);
        }
    }
    const std::string effect =
        areAll ? "line without effect" : "line without effect on these scripts";
    for (const auto& [key, place] : keys) {
        const auto meant = missing.find(inSmallLetters(key));
        if (meant != missing.end() && wanted.count(key) == 0 && hasSameParts(key, meant->second)) {
            findings.push_back({file, place.line, place.column, Severity::Warning,
                                effect + ": sennet looks for " + meant->second});
        }
    }
}

}  // namespace sennetctl
