#include "Velm/PropertiesFile.h"

#include <cerrno>
#include <cstddef>
#include <optional>

#include "utf8/Utf8.h"
#include "velmclient/FileDescriptor.h"
#include "velmclient/PropertiesParser.h"
#include "velmclient/SystemLog.h"

namespace Velm {

namespace {

constexpr std::size_t kMaxFileSize = 16 * 1024 * 1024;
constexpr std::size_t kReadSize = 64 * 1024;

// The bytes of a regular file, or nothing with errno set. Counts what it reads, because the size
// that the file system states is 0 for files of /proc and may grow meanwhile.
std::optional<std::string> readWholeFile(const char* path) {
    const FileDescriptor file = FileDescriptor::openRegularFile(path);
    if (!file.isOpen()) {
        return std::nullopt;
    }
    std::string bytes;
    for (;;) {
        const std::size_t length = bytes.size();
        bytes.resize(length + kReadSize);
        const ssize_t count = file.read(bytes.data() + length, kReadSize);
        if (count < 0) {
            return std::nullopt;
        }
        bytes.resize(length + static_cast<std::size_t>(count));
        if (count == 0) {
            return bytes;
        }
        if (bytes.size() > kMaxFileSize) {
            errno = EFBIG;
            return std::nullopt;
        }
    }
}

}  // namespace

PropertiesFile::PropertiesFile(const char* path) : path(path != nullptr ? path : "") {}

bool PropertiesFile::load() {
    properties = Properties();
    const std::optional<std::string> bytes = readWholeFile(path.c_str());
    if (!bytes) {
        if (errno != ENOENT) {
            logFailure("read", path, errno);
        }
        return false;
    }
    properties = PropertiesParser(utf8::clean(*bytes)).parse();
    return true;
}

const Properties& PropertiesFile::getProperties() const {
    return properties;
}

}  // namespace Velm
