#include "files/BoundedFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <functional>
#include <limits>

namespace cimomd {
namespace {

constexpr std::size_t kFirstPiece = 4096;
constexpr std::size_t kLargestPiece = std::size_t{1} << 20;

class Descriptor {
  public:
    // Not blocking, so that a named pipe in place of a file does not hold the reader up.
    explicit Descriptor(const char* path)
        : number(::open(path, O_RDONLY | O_CLOEXEC | O_NONBLOCK | O_NOCTTY)) {}
    ~Descriptor() {
        if (number >= 0)
            ::close(number);
    }
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;

    int get() const { return number; }
    bool isRegularFile() const {
        struct stat status {};
        return ::fstat(number, &status) == 0 && S_ISREG(status.st_mode);
    }

  private:
    int number;
};

bool meansAbsent(int error) {
    return error == ENOENT || error == ENOTDIR || error == ENODEV || error == ESRCH;
}

FileStatus failureOf(int error) {
    if (meansAbsent(error))
        return FileStatus::Absent;
    return error == EACCES || error == EPERM ? FileStatus::Forbidden : FileStatus::Unreadable;
}

FileStatus readAll(int descriptor, std::size_t maxBytes, std::string& bytes) {
    std::size_t length = 0;
    while (true) {
        // One byte more than allowed tells a file that is too long from one that just fits.
        const std::size_t piece =
            std::min({std::max(length, kFirstPiece), kLargestPiece, maxBytes + 1 - length});
        bytes.resize(length + piece);
        const ssize_t count = ::read(descriptor, bytes.data() + length, piece);
        if (count < 0 && errno == EINTR)
            continue;
        if (count < 0)
            return failureOf(errno);
        length += static_cast<std::size_t>(count);
        bytes.resize(length);
        if (length > maxBytes)
            return FileStatus::TooLong;
        if (count == 0)
            return FileStatus::Read;
    }
}

FileStatus readPart(int descriptor, std::uint64_t offset, std::size_t maxBytes,
                    std::string& bytes) {
    if (offset > static_cast<std::uint64_t>(std::numeric_limits<off_t>::max()))
        return FileStatus::Read;
    // Not pread: kernel files need not know places, and are only read from their beginning.
    if (offset > 0 && ::lseek(descriptor, static_cast<off_t>(offset), SEEK_SET) < 0)
        return failureOf(errno);
    const FileStatus status = readAll(descriptor, maxBytes, bytes);
    bytes.resize(std::min(bytes.size(), maxBytes));
    return status == FileStatus::TooLong ? FileStatus::Read : status;
}

using ReadDescriptor = std::function<FileStatus(int descriptor, std::string& bytes)>;

FileContent readWith(const std::filesystem::path& path, const ReadDescriptor& readDescriptor) {
    FileContent content;
    const Descriptor descriptor(path.c_str());
    if (descriptor.get() < 0) {
        content.status = failureOf(errno);
        return content;
    }
    if (!descriptor.isRegularFile()) {
        content.status = FileStatus::Unreadable;
        return content;
    }
    content.status = readDescriptor(descriptor.get(), content.bytes);
    if (content.status != FileStatus::Read)
        content.bytes.clear();
    return content;
}

}  // namespace

FileContent readBoundedFile(const std::filesystem::path& path, std::size_t maxBytes) {
    return readWith(path, [maxBytes](int descriptor, std::string& bytes) {
        return readAll(descriptor, maxBytes, bytes);
    });
}

FileContent readFilePart(const std::filesystem::path& path, std::uint64_t offset,
                         std::size_t maxBytes) {
    return readWith(path, [=](int descriptor, std::string& bytes) {
        return readPart(descriptor, offset, maxBytes, bytes);
    });
}

FileStatus readFileStart(const char* path, char* buffer, std::size_t capacity,
                         std::size_t& length) {
    length = 0;
    const Descriptor descriptor(path);
    if (descriptor.get() < 0)
        return failureOf(errno);
    if (!descriptor.isRegularFile())
        return FileStatus::Unreadable;
    std::size_t end = 0;
    while (end < capacity) {
        const ssize_t count = ::read(descriptor.get(), buffer + end, capacity - end);
        if (count < 0 && errno == EINTR)
            continue;
        if (count < 0)
            return failureOf(errno);
        if (count == 0)
            break;
        end += static_cast<std::size_t>(count);
    }
    length = end;
    return FileStatus::Read;
}

}  // namespace cimomd
