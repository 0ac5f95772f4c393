#include "mof/MofPaths.h"

#include <algorithm>
#include <system_error>

#include "text/Utf8.h"

namespace cimomd {
namespace {

std::string withSlashes(std::string_view text) {
    std::string out(text);
    std::replace(out.begin(), out.end(), '\\', '/');
    return out;
}

/// The entry of `directory`, which may be empty, with this name.
std::filesystem::path entryNamed(const std::filesystem::path& directory,
                                 const std::filesystem::path& name) {
    std::error_code error;
    if (std::filesystem::exists(directory / name, error))
        return directory / name;
    const std::filesystem::path listed = directory.empty() ? "." : directory;
    std::filesystem::directory_iterator entry(listed, error);
    for (; !error && entry != std::filesystem::directory_iterator(); entry.increment(error)) {
        const std::filesystem::path found = entry->path().filename();
        if (equalsIgnoringCase(found.string(), name.string()))
            return directory / found;
    }
    return directory / name;
}

}  // namespace

std::filesystem::path includedFile(const std::filesystem::path& directory, std::string_view text) {
    const std::filesystem::path named = withSlashes(text);
    std::filesystem::path exact = (directory / named).lexically_normal();
    std::error_code error;
    if (named.is_absolute() || std::filesystem::exists(exact, error))
        return exact;
    std::filesystem::path path = directory;
    for (const std::filesystem::path& name : named)
        path = entryNamed(path, name);
    return path.lexically_normal();
}

std::string namespaceIn(std::string_view text) {
    std::string path = withSlashes(text);
    const std::size_t slashes = path.find("//");
    const bool hasHost = slashes == 0 || (slashes != std::string::npos && path[slashes - 1] == ':');
    if (!hasHost)
        return path;
    const std::size_t hostEnd = path.find('/', slashes + 2);
    return hostEnd == std::string::npos ? std::string() : path.substr(hostEnd);
}

}  // namespace cimomd
