#include "velmclient/ReplacingFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <utility>

#include "velmclient/SystemLog.h"
#include "velmclient/TemporaryNames.h"

namespace Velm {

namespace {

constexpr std::size_t kBufferSize = 64 * 1024;
constexpr int kNameAttempts = 100;
constexpr unsigned int kNewFileMode = 0666;
// A stranger who could open a file with a name could lock it, and it would seem to be in use.
constexpr unsigned int kHiddenFileMode = 0600;
constexpr unsigned int kPermissionBits = 0777;

std::string descriptorPath(int descriptor) {
    return "/proc/self/fd/" + std::to_string(descriptor);
}

// Threads that make files meanwhile make them too private, never too open.
unsigned int maskOfNewFiles() {
    const mode_t mask = ::umask(kPermissionBits);
    ::umask(mask);
    return mask;
}

// Calls `make` with random hidden names until one is free; make returns 0 or an error number.
template <typename Make>
int withFreeName(std::string& hiddenName, Make make) {
    for (int attempt = 0; attempt < kNameAttempts; ++attempt) {
        std::string candidate = randomTemporaryName();
        if (candidate.empty()) {
            return errno;
        }
        const int error = make(candidate.c_str());
        if (error == 0) {
            hiddenName = std::move(candidate);
        }
        if (error != EEXIST) {
            return error;
        }
    }
    return EEXIST;
}

}  // namespace

ReplacingFile::ReplacingFile(std::string path, Temporary temporary)
    : path(std::move(path)), temporary(temporary) {}

ReplacingFile::~ReplacingFile() {
    discard();
}

bool ReplacingFile::open() {
    return succeeded(prepare());
}

int ReplacingFile::prepare() {
    int error = openDirectory();
    if (error == 0) {
        error = readPreviousMode();
    }
    if (error != 0) {
        return error;
    }
    removeAbandonedFiles(directory.get());
    if (temporary == Temporary::kNamelessWherePossible) {
        openNameless(mode.value_or(kNewFileMode));
    }
    if (!file.isOpen()) {
        error = openHidden();
    }
    buffer.reserve(kBufferSize);
    return error;
}

// Everything else is done relative to the directory, so that neither a change of the working
// directory nor a rename of this one parts the temporary file from its target.
int ReplacingFile::openDirectory() {
    const std::size_t slash = path.rfind('/');
    const std::size_t nameStart = slash == std::string::npos ? 0 : slash + 1;
    name = path.substr(nameStart);
    if (name.empty()) {
        return path.empty() ? ENOENT : EISDIR;
    }
    const std::string parent = nameStart == 0 ? "." : path.substr(0, nameStart);
    directory = FileDescriptor(::open(parent.c_str(), O_PATH | O_DIRECTORY | O_CLOEXEC));
    return directory.isOpen() ? 0 : errno;
}

int ReplacingFile::readPreviousMode() {
    struct stat previous {};
    if (::fstatat(directory.get(), name.c_str(), &previous, AT_SYMLINK_NOFOLLOW) != 0) {
        return errno == ENOENT ? 0 : errno;
    }
    if (S_ISREG(previous.st_mode)) {
        // Somebody else who may write into the directory must not choose who may write to our file.
        if (previous.st_uid == ::geteuid() && previous.st_nlink == 1) {
            mode = previous.st_mode & kPermissionBits;
        }
        return 0;
    }
    if (S_ISLNK(previous.st_mode)) {
        return 0;
    }
    // A rename would put a file where a device, a FIFO or a socket stood.
    return S_ISDIR(previous.st_mode) ? EISDIR : EINVAL;
}

void ReplacingFile::openNameless(unsigned int firstMode) {
    file =
        FileDescriptor(::openat(directory.get(), ".", O_TMPFILE | O_WRONLY | O_CLOEXEC, firstMode));
    // It gets its name through /proc, which may not be mounted.
    if (file.isOpen() && ::access(descriptorPath(file.get()).c_str(), F_OK) != 0) {
        file.close();
    }
}

int ReplacingFile::openHidden() {
    if (!mode) {
        mode = kNewFileMode & ~maskOfNewFiles();
    }
    return withFreeName(hiddenName, [&](const char* candidate) {
        file = FileDescriptor(::openat(directory.get(), candidate,
                                       O_WRONLY | O_CREAT | O_EXCL | O_NOFOLLOW | O_CLOEXEC,
                                       kHiddenFileMode));
        if (!file.isOpen()) {
            return errno;
        }
        if (lockTemporaryFile(file.get())) {
            return 0;
        }
        (void)::unlinkat(directory.get(), candidate, 0);
        return EEXIST;
    });
}

bool ReplacingFile::write(std::string_view bytes) {
    if (failed) {
        return false;
    }
    if (buffer.size() + bytes.size() <= kBufferSize) {
        buffer.append(bytes);
        return true;
    }
    int error = flush();
    if (error == 0 && bytes.size() < kBufferSize) {
        buffer.append(bytes);
    } else if (error == 0) {
        error = file.writeAll(bytes.data(), bytes.size());
    }
    return succeeded(error);
}

int ReplacingFile::flush() {
    const int error = file.writeAll(buffer.data(), buffer.size());
    buffer.clear();
    return error;
}

bool ReplacingFile::commit() {
    if (failed) {
        return false;
    }
    const bool done = succeeded(finish());
    discard();
    return done;
}

int ReplacingFile::finish() {
    int error = flush();
    // Network and thin file systems tell only now that the bytes did not fit; and after a power cut
    // the new name must not stand for an empty file. EINVAL: the file system cannot synchronise.
    if (error == 0 && ::fdatasync(file.get()) != 0 && errno != EINVAL) {
        error = errno;
    }
    // Where the file system keeps no modes, nothing is lost.
    if (error == 0 && mode) {
        (void)::fchmod(file.get(), *mode);
    }
    if (error == 0 && hiddenName.empty()) {
        error = linkHidden();
    }
    // Keeps the lock until the hidden name is gone. Without it the worst is a rename that fails.
    const FileDescriptor lock(::fcntl(file.get(), F_DUPFD_CLOEXEC, 0));
    if (error == 0) {
        error = file.close();
    }
    if (error == 0 &&
        ::renameat(directory.get(), hiddenName.c_str(), directory.get(), name.c_str()) != 0) {
        error = errno;
    }
    if (error == 0) {
        hiddenName.clear();
    }
    return error;
}

// A link cannot replace a file, so the nameless file gets a hidden name first.
int ReplacingFile::linkHidden() {
    const std::string source = descriptorPath(file.get());
    (void)lockTemporaryFile(file.get());
    return withFreeName(hiddenName, [&](const char* candidate) {
        const int result =
            ::linkat(AT_FDCWD, source.c_str(), directory.get(), candidate, AT_SYMLINK_FOLLOW);
        return result == 0 ? 0 : errno;
    });
}

bool ReplacingFile::succeeded(int error) {
    if (error != 0) {
        logFailure("write", path, error);
        failed = true;
        discard();
        errno = error;
    }
    return error == 0;
}

void ReplacingFile::discard() {
    file.close();
    if (!hiddenName.empty()) {
        if (::unlinkat(directory.get(), hiddenName.c_str(), 0) != 0) {
            logFailure("remove", hiddenName, errno);
        }
        hiddenName.clear();
    }
    directory.close();
}

}  // namespace Velm
