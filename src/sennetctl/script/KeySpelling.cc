#include "script/KeySpelling.h"

#include <algorithm>
#include <optional>
#include <utility>

#include "properties/PropertiesEntries.h"

namespace sennetctl {

namespace {

std::string inSmallLetters(std::string text) {
    std::transform(text.begin(), text.end(), text.begin(), [](char c) {
        return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
    });
    return text;
}

}  // namespace

KeySpelling::KeySpelling(std::string theFile, std::string_view octets) : file(std::move(theFile)) {
    Velm::PropertiesEntries entries(octets);
    while (const std::optional<Velm::PropertiesEntry> entry = entries.next()) {
        keys.emplace(inSmallLetters(entry->key), Key{entry->key, entry->line, entry->keyColumn});
    }
}

void KeySpelling::check(const ScriptModel& model, std::vector<Finding>& findings) {
    for (const ScriptSlot& slot : model.slots) {
        if (slot.serverSpelling.empty()) {
            continue;
        }
        for (const ScriptText& property : slot.properties) {
            const std::string key = slot.serverSpelling + "." + property.value;
            checkKey(key, findings);
            checkKey(key + ".Size", findings);
        }
    }
}

void KeySpelling::checkKey(const std::string& wanted, std::vector<Finding>& findings) {
    const auto [first, last] = keys.equal_range(inSmallLetters(wanted));
    if (std::any_of(first, last, [&](const auto& known) { return known.second.text == wanted; })) {
        return;
    }
    for (auto known = first; known != last; ++known) {
        Key& key = known->second;
        if (!std::exchange(key.isTold, true)) {
            findings.push_back({file, key.line, key.column, Severity::Warning,
                                "line without effect: sennet looks for " + wanted});
        }
    }
}

}  // namespace sennetctl
