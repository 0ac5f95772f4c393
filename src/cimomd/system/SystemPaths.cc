#include "system/SystemPaths.h"

#include <stdexcept>
#include <string>

namespace cimomd {

std::filesystem::path SystemPaths::below(std::string_view path) const {
    if (root.empty())
        throw std::logic_error("no root directory was set for " + std::string(path));
    return root / path;
}

}  // namespace cimomd
