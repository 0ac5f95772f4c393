#include "script/OutputEntries.h"

#include <iterator>
#include <map>
#include <string>

namespace sennetctl {

namespace {

using Velm::PropertiesEntry;

/// Without empty values, which stand for the default.
std::map<std::string, PropertiesEntry> entriesIn(std::string_view octets) {
    std::map<std::string, PropertiesEntry> entries = Velm::lastEntriesIn(octets);
    for (auto entry = entries.begin(); entry != entries.end();) {
        entry = entry->second.value.empty() ? entries.erase(entry) : std::next(entry);
    }
    return entries;
}

}  // namespace

std::vector<OutputEntry> outputEntriesIn(std::string_view octets) {
    const std::map<std::string, PropertiesEntry> entries = entriesIn(octets);
    std::vector<OutputEntry> outputs;
    for (const OutputPlace& place : outputPlaces()) {
        auto entry = entries.find(place.key());
        if (entry == entries.end()) {
            entry = entries.find(place.generalKey);
        }
        if (entry != entries.end() && entry->second.value[0] == '/') {
            outputs.push_back({place, entry->second});
        }
    }
    return outputs;
}

}  // namespace sennetctl
