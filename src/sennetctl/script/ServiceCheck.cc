#include "script/ServiceCheck.h"

#include <sys/stat.h>
#include <sys/xattr.h>

#include <algorithm>
#include <filesystem>
#include <set>
#include <system_error>

#include "script/OutputEntries.h"

namespace sennetctl {

namespace {

namespace fs = std::filesystem;

constexpr const char* kStateDirectory = "/var/lib/sennet";

fs::path realPath(const fs::path& path) {
    std::error_code error;
    const fs::path real = fs::weakly_canonical(path, error);
    return error ? path.lexically_normal() : real;
}

bool isWithin(const fs::path& path, const fs::path& directory) {
    const fs::path real = realPath(path);
    const fs::path above = realPath(directory);
    const auto [end, other] = std::mismatch(above.begin(), above.end(), real.begin(), real.end());
    return end == above.end() || (end->empty() && std::next(end) == above.end());
}

/// The directory, or the nearest one above it: what is missing is made.
fs::path presentPart(fs::path path) {
    struct stat status {};
    while (path.has_relative_path() && ::stat(path.c_str(), &status) != 0) {
        path = path.parent_path();
    }
    return path;
}

/// Whether the mode lets root write that has no privilege to pass over it. Access lists may let
/// anybody, and what is no directory is told in any case.
bool isModeFine(const fs::path& place) {
    struct stat status {};
    if (::stat(place.c_str(), &status) != 0 || !S_ISDIR(status.st_mode) ||
        ::getxattr(place.c_str(), "system.posix_acl_access", nullptr, 0) > 0) {
        return true;
    }
    const mode_t wanted = status.st_uid == 0   ? S_IWUSR | S_IXUSR
                          : status.st_gid == 0 ? S_IWGRP | S_IXGRP
                                               : S_IWOTH | S_IXOTH;
    return (status.st_mode & wanted) == wanted;
}

/// Why the service cannot write; empty when it can.
std::string obstacle(const ServiceRules& rules, const fs::path& directory) {
    const bool isAllowed =
        std::any_of(rules.writable.begin(), rules.writable.end(),
                    [&](const std::string& path) { return isWithin(directory, path); });
    if (rules.isReadOnly && !isAllowed) {
        return "its ReadWritePaths do not allow it";
    }
    const fs::path place = presentPart(directory);
    return rules.isOverriding || isModeFine(place)
               ? std::string()
               : place.string() + " is not root's to write, and the service may not pass over that";
}

}  // namespace

void checkServiceOutput(const std::string& file, std::string_view octets,
                        const ServiceRulesOf& rulesOf, std::vector<Finding>& findings) {
    std::set<std::string> told;
    for (const OutputEntry& output : outputEntriesIn(octets)) {
        const Velm::PropertiesEntry& entry = output.entry;
        const bool isUsual =
            isWithin(entry.value, kStateDirectory) && isModeFine(presentPart(entry.value));
        if (isUsual || told.count(entry.key) > 0) {
            continue;
        }
        const std::optional<ServiceRules> rules = rulesOf(output.place.product);
        const std::string reason = rules ? obstacle(*rules, entry.value) : std::string();
        if (!reason.empty()) {
            told.insert(entry.key);
            findings.push_back({file, entry.line, entry.valueColumn,
                                rules->isScheduled ? Severity::Warning : Severity::Note,
                                std::string("sennet@") + output.place.product +
                                    ".service writes nothing into " + entry.value + ": " + reason});
        }
    }
}

}  // namespace sennetctl
