#include "script/KeySpelling.h"

#include <map>
#include <utility>

#include "script/NameCheck.h"
#include "script/ScriptText.h"

namespace sennetctl {

namespace {

constexpr std::string_view kTitle = "title.";
constexpr std::string_view kSize = ".Size";

/// What is wrong with these parts is told of every key.
bool hasSameParts(std::string_view one, std::string_view other) {
    return one.starts_with(kTitle) == other.starts_with(kTitle) &&
           one.ends_with(kSize) == other.ends_with(kSize);
}

}  // namespace

KeySpelling::KeySpelling(std::string theFile, std::string_view octets)
    : file(std::move(theFile)), keys(Velm::lastEntriesIn(octets)) {}

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
    for (const auto& [key, entry] : keys) {
        const auto meant = missing.find(inSmallLetters(key));
        if (meant != missing.end() && wanted.count(key) == 0 && hasSameParts(key, meant->second)) {
            findings.push_back({file, entry.line, entry.keyColumn, Severity::Warning,
                                effect + ": sennet looks for " + meant->second});
        }
    }
}

}  // namespace sennetctl
