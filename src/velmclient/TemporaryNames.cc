#include "velmclient/TemporaryNames.h"

#include <dirent.h>
#include <fcntl.h>
#include <sys/file.h>
#include <sys/random.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstdint>
#include <cstdio>
#include <memory>
#include <vector>

#include "velmclient/FileDescriptor.h"

namespace Velm {

namespace {

constexpr std::string_view kPrefix = ".velm-";
constexpr std::string_view kSuffix = ".tmp";
constexpr std::size_t kDigits = 16;
// Others may fill the directory with such names, and it is looked through for each output file.
constexpr int kEntriesLookedAt = 4096;

bool isHexDigit(char c) {
    return (c >= '0' && c <= '9') || (c >= 'a' && c <= 'f');
}

bool isOwnFile(const struct stat& status) {
    return S_ISREG(status.st_mode) && status.st_nlink == 1 && status.st_uid == ::geteuid();
}

bool isSameFile(const struct stat& a, const struct stat& b) {
    return a.st_dev == b.st_dev && a.st_ino == b.st_ino;
}

bool tryLock(int descriptor) {
    return ::flock(descriptor, LOCK_EX | LOCK_NB) == 0;
}

struct DirectoryCloser {
    void operator()(DIR* stream) const { ::closedir(stream); }
};

std::vector<std::string> temporaryNamesIn(int directory) {
    const int readable = ::openat(directory, ".", O_RDONLY | O_DIRECTORY | O_CLOEXEC);
    const std::unique_ptr<DIR, DirectoryCloser> stream(readable < 0 ? nullptr
                                                                    : ::fdopendir(readable));
    std::vector<std::string> names;
    if (!stream) {
        FileDescriptor(readable).close();
        return names;
    }
    for (int left = kEntriesLookedAt; left > 0; --left) {
        const dirent* entry = ::readdir(stream.get());
        if (entry == nullptr) {
            break;
        }
        if (isTemporaryName(entry->d_name)) {
            names.emplace_back(entry->d_name);
        }
    }
    return names;
}

void removeIfAbandoned(int directory, const char* name) {
    struct stat named {};
    if (::fstatat(directory, name, &named, AT_SYMLINK_NOFOLLOW) != 0 || !isOwnFile(named)) {
        return;
    }
    // Some file systems lock only what is open for writing.
    const FileDescriptor file(
        ::openat(directory, name, O_WRONLY | O_NOFOLLOW | O_NONBLOCK | O_NOCTTY | O_CLOEXEC));
    if (!file.isOpen() || !tryLock(file.get())) {
        return;
    }
    struct stat locked {};
    if (::fstat(file.get(), &locked) == 0 && isSameFile(locked, named) &&
        ::fstatat(directory, name, &named, AT_SYMLINK_NOFOLLOW) == 0 && isSameFile(locked, named)) {
        (void)::unlinkat(directory, name, 0);
    }
}

}  // namespace

std::string randomTemporaryName() {
    std::uint64_t number = 0;
    if (::getrandom(&number, sizeof number, 0) != static_cast<ssize_t>(sizeof number)) {
        return {};
    }
    char digits[kDigits + 1];
    std::snprintf(digits, sizeof digits, "%016llx", static_cast<unsigned long long>(number));
    return std::string(kPrefix) + digits + std::string(kSuffix);
}

bool isTemporaryName(std::string_view name) {
    if (name.size() != kPrefix.size() + kDigits + kSuffix.size() ||
        name.substr(0, kPrefix.size()) != kPrefix ||
        name.substr(kPrefix.size() + kDigits) != kSuffix) {
        return false;
    }
    const std::string_view digits = name.substr(kPrefix.size(), kDigits);
    return std::all_of(digits.begin(), digits.end(), isHexDigit);
}

bool lockTemporaryFile(int descriptor) {
    if (!tryLock(descriptor)) {
        return errno != EWOULDBLOCK;
    }
    struct stat status {};
    return ::fstat(descriptor, &status) != 0 || status.st_nlink > 0;
}

void removeAbandonedFiles(int directory) {
    for (const std::string& name : temporaryNamesIn(directory)) {
        removeIfAbandoned(directory, name.c_str());
    }
}

}  // namespace Velm
