#include "script/PassedOver.h"

#include <algorithm>
#include <filesystem>
#include <system_error>

#include "script/ScriptText.h"

namespace sennetctl {

namespace {

namespace fs = std::filesystem;

/// Null for a file.
const char* kindOf(const fs::directory_entry& entry) {
    std::error_code error;
    const fs::file_status status = entry.status(error);
    if (fs::is_regular_file(status)) {
        return nullptr;
    }
    if (fs::is_directory(status)) {
        return "a directory";
    }
    if (error == std::errc::permission_denied) {
        return "nothing that this user may look at";
    }
    return fs::exists(status) ? "a device, pipe or socket" : "a link that leads nowhere";
}

}  // namespace

void checkPassedOver(const std::string& directory, std::vector<Finding>& findings) {
    std::vector<Finding> found;
    std::error_code error;
    for (fs::directory_iterator entry(directory, error), end; !error && entry != end;
         entry.increment(error)) {
        const std::string name = entry->path().filename().string();
        const char* kind = isCalledScript(name) ? kindOf(*entry) : nullptr;
        if (kind != nullptr) {
            // As the files that are read are named.
            std::string path = directory;
            path.append("/").append(name);
            found.push_back(
                {path, 0, 0, Severity::Warning,
                 std::string(kind) + ", which sennet passes over: files of an earlier run stay"});
        }
    }
    std::sort(found.begin(), found.end(),
              [](const Finding& one, const Finding& two) { return one.file < two.file; });
    findings.insert(findings.end(), found.begin(), found.end());
}

}  // namespace sennetctl
