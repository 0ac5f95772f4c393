#include "script/OutputCheck.h"

#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <filesystem>
#include <optional>
#include <set>
#include <system_error>

#include "script/OutputEntries.h"

namespace sennetctl {

namespace {

struct Fault {
    Severity severity = Severity::Error;
    std::string reason;
};

std::string because(const std::filesystem::path& place, int error) {
    return place.string() + ": " + std::generic_category().message(error);
}

/// Files of another user may be no business of this one.
Fault refusal(const std::filesystem::path& place, bool isOwn, int error) {
    const bool isForOthers = error == EACCES && ::geteuid() != 0 && !isOwn;
    return {isForOthers ? Severity::Note : Severity::Warning,
            because(place, error) + (isForOthers ? " for this user" : "")};
}

std::optional<Fault> faultOfPresent(const std::filesystem::path& place, const struct stat& status) {
    if (!S_ISDIR(status.st_mode)) {
        return Fault{Severity::Error, place.string() + " is no directory"};
    }
    if (::access(place.c_str(), W_OK | X_OK) != 0) {
        return refusal(place, status.st_uid == ::geteuid(), errno);
    }
    return std::nullopt;
}

/// What is missing is made, so that the directory above it counts.
std::optional<Fault> faultOf(const std::string& directory) {
    std::filesystem::path place = directory;
    struct stat status {};
    while (::stat(place.c_str(), &status) != 0) {
        const int error = errno;
        std::error_code ignored;
        if (error == EACCES) {
            return refusal(place, false, error);
        }
        const bool isMissing = error == ENOENT || error == ENOTDIR;
        if (!isMissing || std::filesystem::is_symlink(place, ignored)) {
            return Fault{Severity::Error, because(place, error)};
        }
        place = place.parent_path();
    }
    return faultOfPresent(place, status);
}

}  // namespace

void checkOutputDirectories(const std::string& file, std::string_view octets,
                            std::vector<Finding>& findings) {
    std::set<std::string> looked;
    for (const OutputEntry& output : outputEntriesIn(octets)) {
        const Velm::PropertiesEntry& entry = output.entry;
        if (!looked.insert(entry.key).second) {
            continue;
        }
        if (const std::optional<Fault> fault = faultOf(entry.value)) {
            findings.push_back(
                {file, entry.line, entry.valueColumn, fault->severity,
                 "sennet writes nothing into " + entry.value + ": " + fault->reason});
        }
    }
}

}  // namespace sennetctl
