#include "velmclient/FileDescriptor.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <utility>

namespace Velm {

FileDescriptor::~FileDescriptor() {
    close();
}

FileDescriptor::FileDescriptor(FileDescriptor&& other) noexcept
    : number(std::exchange(other.number, -1)) {}

FileDescriptor& FileDescriptor::operator=(FileDescriptor&& other) noexcept {
    if (this != &other) {
        close();
        number = std::exchange(other.number, -1);
    }
    return *this;
}

FileDescriptor FileDescriptor::openRegularFile(const char* path) {
    // Without O_NONBLOCK the open of a FIFO would wait for a writer.
    FileDescriptor file(::open(path, O_RDONLY | O_CLOEXEC | O_NOCTTY | O_NONBLOCK));
    struct stat status {};
    if (!file.isOpen() || ::fstat(file.get(), &status) != 0) {
        return {};
    }
    if (!S_ISREG(status.st_mode)) {
        file.close();
        errno = S_ISDIR(status.st_mode) ? EISDIR : EINVAL;
    }
    return file;
}

int FileDescriptor::close() {
    const int closing = std::exchange(number, -1);
    if (closing < 0 || ::close(closing) == 0) {
        return 0;
    }
    // An interrupted close has released the descriptor all the same.
    return errno == EINTR ? 0 : errno;
}

ssize_t FileDescriptor::read(char* buffer, std::size_t size) const {
    ssize_t count = 0;
    do {
        count = ::read(number, buffer, size);
    } while (count < 0 && errno == EINTR);
    return count;
}

int FileDescriptor::writeAll(const char* bytes, std::size_t size) const {
    while (size > 0) {
        const ssize_t count = ::write(number, bytes, size);
        if (count < 0 && errno == EINTR) {
            continue;
        }
        if (count <= 0) {
            return count < 0 ? errno : ENOSPC;
        }
        bytes += count;
        size -= static_cast<std::size_t>(count);
    }
    return 0;
}

}  // namespace Velm
