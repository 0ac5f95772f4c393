#include "Velm/TextFile.h"

#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstddef>
#include <filesystem>
#include <string_view>
#include <system_error>
#include <utility>

#include "velmclient/FileDescriptor.h"
#include "velmclient/LineReader.h"
#include "velmclient/ReplacingFile.h"
#include "velmclient/SystemLog.h"

namespace Velm {

namespace {

constexpr int kModeRead = 0;
constexpr int kModeWrite = 1;

std::string textOrEmpty(const char* text) {
    return text != nullptr ? text : "";
}

}  // namespace

TextFile::TextFile(const char* path) : path(textOrEmpty(path)) {}

TextFile::~TextFile() = default;

bool TextFile::exists() const {
    struct stat status {};
    return ::stat(path.c_str(), &status) == 0;
}

int TextFile::mkdir(int parents) {
    std::error_code error;
    if (parents == 1) {
        std::filesystem::create_directories(path, error);
    } else {
        std::filesystem::create_directory(path, error);
    }
    if (error) {
        logFailure("create directory", path, error.value());
        errno = error.value();
        return -1;
    }
    return 0;
}

void TextFile::setFileName(const char* newPath) {
    path = textOrEmpty(newPath);
}

int TextFile::open(int mode) {
    reader.reset();
    writer.reset();
    if (mode == kModeRead) {
        FileDescriptor file = FileDescriptor::openRegularFile(path.c_str());
        if (file.isOpen()) {
            reader = std::make_unique<LineReader>(std::move(file), path);
            return 0;
        }
        logFailure("read", path, errno);
        return -1;
    }
    if (mode == kModeWrite) {
        auto opening = std::make_unique<ReplacingFile>(path);
        if (opening->open()) {
            writer = std::move(opening);
            return 0;
        }
        return -1;
    }
    logFailure("open", path, EINVAL);
    return -1;
}

int TextFile::readLine(char* buffer, int limit) {
    if (!reader || buffer == nullptr || limit < 0) {
        return -1;
    }
    return reader->readLine(buffer, limit);
}

int TextFile::writeLine(const char* text, int length) {
    if (!writer || text == nullptr || length < 0) {
        return -1;
    }
    return writer->write({text, static_cast<std::size_t>(length)}) ? length : -1;
}

int TextFile::close() {
    reader.reset();
    const std::unique_ptr<ReplacingFile> closing = std::move(writer);
    return !closing || closing->commit() ? 0 : -1;
}

int TextFile::remove() {
    if (::unlink(path.c_str()) == 0 || errno == ENOENT) {
        return 0;
    }
    logFailure("remove", path, errno);
    return -1;
}

}  // namespace Velm
