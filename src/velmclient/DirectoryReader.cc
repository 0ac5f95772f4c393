#include "Velm/DirectoryReader.h"

#include <dirent.h>
#include <fcntl.h>
#include <sys/stat.h>

#include <algorithm>
#include <cerrno>
#include <cstddef>
#include <memory>
#include <string_view>

#include "Velm/PlatformUtilities.h"
#include "velmclient/SystemLog.h"

namespace Velm {

namespace {

struct CloseDirectory {
    void operator()(DIR* directory) const { ::closedir(directory); }
};

char asciiLower(char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

bool endsWith(std::string_view name, std::string_view pattern) {
    return name.size() >= pattern.size() &&
           std::equal(pattern.rbegin(), pattern.rend(), name.rbegin(),
                      [](char a, char b) { return asciiLower(a) == asciiLower(b); });
}

bool isRegularFile(DIR* directory, const char* name) {
    struct stat status {};
    return ::fstatat(::dirfd(directory), name, &status, 0) == 0 && S_ISREG(status.st_mode);
}

std::vector<std::string> matchingNames(const std::string& path, std::string_view pattern) {
    std::vector<std::string> names;
    const std::unique_ptr<DIR, CloseDirectory> directory(::opendir(path.c_str()));
    if (!directory) {
        logFailure("list", path, errno);
        return names;
    }
    errno = 0;
    while (const dirent* entry = ::readdir(directory.get())) {
        if (endsWith(entry->d_name, pattern) && isRegularFile(directory.get(), entry->d_name)) {
            names.emplace_back(entry->d_name);
        }
        errno = 0;
    }
    if (errno != 0) {
        logFailure("list", path, errno);
        names.clear();
    }
    std::sort(names.begin(), names.end());
    return names;
}

}  // namespace

DirectoryReader::DirectoryReader(const char* directory, const char* pattern)
    : paths(
          matchingNames(directory != nullptr ? directory : "", pattern != nullptr ? pattern : "")) {
    const std::string prefix =
        std::string(directory != nullptr ? directory : "") + PlatformUtilities::getSeparator();
    for (std::string& path : paths) {
        path.insert(0, prefix);
    }
}

int DirectoryReader::getNumberOfFiles() const {
    return static_cast<int>(paths.size());
}

const char* DirectoryReader::getFileName(int index) const {
    if (index < 0 || index >= getNumberOfFiles()) {
        return nullptr;
    }
    return paths[static_cast<std::size_t>(index)].c_str();
}

}  // namespace Velm
