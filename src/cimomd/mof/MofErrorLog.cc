#include "mof/MofErrorLog.h"

#include <algorithm>
#include <tuple>

namespace cimomd {

void MofErrorLog::add(std::string_view file, MofPosition position, std::string_view found,
                      std::string_view expected) {
    add(file, MofError(file, position, found, expected));
}

void MofErrorLog::add(std::string_view file, const MofError& error) {
    if (entries.size() == kMaxErrors)
        raise(true);
    entries.push_back({indexOf(file), error});
}

void MofErrorLog::raiseIfAny() const {
    if (count() != 0)
        raise(false);
}

std::size_t MofErrorLog::indexOf(std::string_view file) {
    const auto place = std::find(files.begin(), files.end(), file);
    if (place != files.end())
        return static_cast<std::size_t>(place - files.begin());
    files.emplace_back(file);
    return files.size() - 1;
}

void MofErrorLog::raise(bool isCut) const {
    std::vector<Entry> sorted = entries;
    const auto placeOf = [](const Entry& entry) {
        const MofPosition position = entry.error.position();
        return std::make_tuple(entry.fileIndex, position.line, position.column);
    };
    std::stable_sort(sorted.begin(), sorted.end(),
                     [&](const Entry& a, const Entry& b) { return placeOf(a) < placeOf(b); });
    std::vector<MofError> errors;
    errors.reserve(sorted.size());
    for (const Entry& entry : sorted)
        errors.push_back(entry.error);
    throw MofErrors(std::move(errors), isCut);
}

}  // namespace cimomd
