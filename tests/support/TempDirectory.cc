#include "support/TempDirectory.h"

#include <cstdlib>
#include <filesystem>
#include <stdexcept>
#include <system_error>

#include "support/Files.h"

namespace support {

TempDirectory::TempDirectory() {
    root = (std::filesystem::temp_directory_path() / "sennet-test-XXXXXX").string();
    if (mkdtemp(root.data()) == nullptr) {
        throw std::runtime_error("cannot make a directory like " + root);
    }
}

TempDirectory::~TempDirectory() {
    std::error_code ignored;
    std::filesystem::remove_all(root, ignored);
}

std::string TempDirectory::path(std::string_view name) const {
    return name.empty() ? root : root + '/' + std::string(name);
}

std::string TempDirectory::write(std::string_view name, std::string_view bytes) const {
    std::string file = path(name);
    writeFile(file, bytes);
    return file;
}

std::string TempDirectory::read(std::string_view name) const {
    return readFile(path(name));
}

std::vector<std::string> TempDirectory::names() const {
    return namesIn(root);
}

}  // namespace support
