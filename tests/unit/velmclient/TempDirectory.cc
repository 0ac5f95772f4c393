#include "TempDirectory.h"

#include <stdlib.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <stdexcept>

TempDirectory::TempDirectory() {
    root = (std::filesystem::temp_directory_path() / "velm-test-XXXXXX").string();
    if (::mkdtemp(root.data()) == nullptr) {
        throw std::runtime_error("cannot make " + root);
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
    const std::string file = path(name);
    std::ofstream out(file, std::ios::binary | std::ios::trunc);
    out.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
    if (!out.flush()) {
        throw std::runtime_error("cannot write " + file);
    }
    return file;
}

std::string TempDirectory::read(std::string_view name) const {
    std::ifstream in(path(name), std::ios::binary);
    if (!in) {
        throw std::runtime_error("cannot read " + path(name));
    }
    return {std::istreambuf_iterator<char>(in), {}};
}

std::vector<std::string> TempDirectory::names() const {
    std::vector<std::string> found;
    for (const auto& entry : std::filesystem::directory_iterator(root)) {
        found.push_back(entry.path().filename().string());
    }
    std::sort(found.begin(), found.end());
    return found;
}
