#include "files/FileTime.h"

#include <sys/stat.h>

#include <cerrno>

#include "files/TextFile.h"

namespace cimomd {

Fact<std::int64_t> modificationTimeOf(const std::filesystem::path& path) {
    struct stat status {};
    if (::stat(path.c_str(), &status) == 0)
        return std::int64_t{status.st_mtim.tv_sec};
    return absenceOf(std::error_code(errno, std::generic_category()));
}

}  // namespace cimomd
