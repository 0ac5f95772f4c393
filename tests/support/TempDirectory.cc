#include "support/TempDirectory.h"

#include <cstdlib>
#include <filesystem>
#include <stdexcept>
#include <system_error>

namespace support {

TempDirectory::TempDirectory() {
    std::string pattern = (std::filesystem::temp_directory_path() / "sennet-test-XXXXXX").string();
    if (mkdtemp(pattern.data()) == nullptr) {
        throw std::runtime_error("cannot make a directory like " + pattern);
    }
    path_ = std::move(pattern);
}

TempDirectory::~TempDirectory() {
    std::error_code ignored;
    std::filesystem::remove_all(path_, ignored);
}

}  // namespace support
