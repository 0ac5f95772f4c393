#include "files/LinkTarget.h"

#include "files/TextFile.h"

namespace cimomd {

Fact<std::string> linkTargetOf(const std::filesystem::path& path) {
    std::error_code error;
    std::string target = std::filesystem::read_symlink(path, error).string();
    if (error)
        return absenceOf(error);
    return target;
}

}  // namespace cimomd
