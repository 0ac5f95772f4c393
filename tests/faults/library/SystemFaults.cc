// Put before the C library by LD_PRELOAD, this gives a program a clock that hastens and a system
// that interrupts, writes little at a time, knows no nameless files, or fails or stops it at one
// given call.
// What it shall do it reads from the environment:
//   FAULTS_CLOCK=N      N seconds of the monotonic clock pass in one
//   FAULTS_INTERRUPT=1  every other call that may wait ends with EINTR; writes take 1000 octets
//   FAULTS_NAMED=1      no file without a name can be made
//   FAULTS_CALL=N       the N-th call that makes, fills or names a file fails
//   FAULTS_ERROR=E      ... with this error number
//   FAULTS_MARK=PATH    ... and writes its name into this new file when it does
//   FAULTS_STOP=1       ... or rather the program stops before it, until it gets SIGCONT

#include <dlfcn.h>
#include <fcntl.h>
#include <poll.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <csignal>
#include <cstdarg>
#include <cstdlib>
#include <cstring>
#include <ctime>
#include <random>

namespace {

constexpr size_t kShortWrite = 1000;
constexpr long kNanoseconds = 1000000000;

long numberOf(const char* name) {
    const char* text = ::getenv(name);
    return text == nullptr ? 0 : ::strtol(text, nullptr, 10);
}

template <typename Function>
Function next(const char* name) {
    return reinterpret_cast<Function>(::dlsym(RTLD_NEXT, name));
}

// Without a pattern, in which a loop of several calls might meet the same answer each time.
bool interrupts() {
    static const bool wanted = numberOf("FAULTS_INTERRUPT") != 0;
    static std::minstd_rand numbers;
    if (wanted && numbers() % 2 == 0) {
        errno = EINTR;
        return true;
    }
    return false;
}

bool failsHere(const char* call) {
    static const long wanted = numberOf("FAULTS_CALL");
    static long calls = 0;
    if (wanted == 0 || ++calls != wanted) {
        return false;
    }
    if (numberOf("FAULTS_STOP") != 0) {
        ::raise(SIGSTOP);
        return false;
    }
    if (const char* mark = ::getenv("FAULTS_MARK")) {
        const long made = ::syscall(SYS_openat, AT_FDCWD, mark, O_CREAT | O_WRONLY, 0600);
        ::syscall(SYS_write, made, call, ::strlen(call));
        ::syscall(SYS_close, made);
    }
    errno = static_cast<int>(numberOf("FAULTS_ERROR"));
    return true;
}

bool isRegularFile(int descriptor) {
    struct stat status {};
    return ::fstat(descriptor, &status) == 0 && S_ISREG(status.st_mode) && descriptor > 2;
}

bool isForWriting(int descriptor) {
    return isRegularFile(descriptor) && (::fcntl(descriptor, F_GETFL) & O_ACCMODE) != O_RDONLY;
}

int openAt(const char* symbol, int directory, const char* path, int flags, mode_t mode) {
    static const bool namedOnly = numberOf("FAULTS_NAMED") != 0;
    if (namedOnly && (flags & O_TMPFILE) == O_TMPFILE) {
        errno = EOPNOTSUPP;
        return -1;
    }
    if ((flags & O_ACCMODE) != O_RDONLY && failsHere("openat")) {
        return -1;
    }
    return next<int (*)(int, const char*, int, ...)>(symbol)(directory, path, flags, mode);
}

mode_t modeOf(int flags, va_list arguments) {
    return (flags & (O_CREAT | O_TMPFILE)) != 0 ? va_arg(arguments, mode_t) : 0;
}

}  // namespace

extern "C" {

int clock_gettime(clockid_t clock, timespec* time) noexcept {
    static const long factor = std::max(1L, numberOf("FAULTS_CLOCK"));
    const auto result = static_cast<int>(::syscall(SYS_clock_gettime, clock, time));
    if (result == 0 && factor > 1 && clock == CLOCK_MONOTONIC) {
        const long nanoseconds = time->tv_nsec * factor;
        time->tv_sec = time->tv_sec * factor + nanoseconds / kNanoseconds;
        time->tv_nsec = nanoseconds % kNanoseconds;
    }
    return result;
}

int poll(pollfd* descriptors, nfds_t count, int milliseconds) {
    static const auto factor = static_cast<int>(std::max(1L, numberOf("FAULTS_CLOCK")));
    if (interrupts()) {
        return -1;
    }
    const int wait = milliseconds > 0 ? milliseconds / factor + (factor > 1) : milliseconds;
    return next<int (*)(pollfd*, nfds_t, int)>("poll")(descriptors, count, wait);
}

ssize_t read(int descriptor, void* buffer, size_t size) {
    return interrupts() ? -1
                        : next<ssize_t (*)(int, void*, size_t)>("read")(descriptor, buffer, size);
}

ssize_t recv(int descriptor, void* buffer, size_t size, int flags) {
    return interrupts() ? -1
                        : next<ssize_t (*)(int, void*, size_t, int)>("recv")(descriptor, buffer,
                                                                             size, flags);
}

ssize_t send(int descriptor, const void* buffer, size_t size, int flags) {
    return interrupts() ? -1
                        : next<ssize_t (*)(int, const void*, size_t, int)>("send")(
                              descriptor, buffer, size, flags);
}

ssize_t write(int descriptor, const void* buffer, size_t size) {
    static const bool little = numberOf("FAULTS_INTERRUPT") != 0;
    if (interrupts() || (isRegularFile(descriptor) && failsHere("write"))) {
        return -1;
    }
    return next<ssize_t (*)(int, const void*, size_t)>("write")(
        descriptor, buffer, little ? std::min(size, kShortWrite) : size);
}

int openat(int directory, const char* path, int flags, ...) {
    va_list arguments;
    va_start(arguments, flags);
    const mode_t mode = modeOf(flags, arguments);
    va_end(arguments);
    return openAt("openat", directory, path, flags, mode);
}

int openat64(int directory, const char* path, int flags, ...) {
    va_list arguments;
    va_start(arguments, flags);
    const mode_t mode = modeOf(flags, arguments);
    va_end(arguments);
    return openAt("openat64", directory, path, flags, mode);
}

int fdatasync(int descriptor) {
    return failsHere("fdatasync") ? -1 : next<int (*)(int)>("fdatasync")(descriptor);
}

int fchmod(int descriptor, mode_t mode) noexcept {
    return failsHere("fchmod") ? -1 : next<int (*)(int, mode_t)>("fchmod")(descriptor, mode);
}

int flock(int descriptor, int operation) noexcept {
    return failsHere("flock") ? -1 : next<int (*)(int, int)>("flock")(descriptor, operation);
}

// A close that fails has closed all the same.
int close(int descriptor) {
    const bool fails = isForWriting(descriptor) && failsHere("close");
    const int error = errno;
    const int result = next<int (*)(int)>("close")(descriptor);
    if (fails) {
        errno = error;
    }
    return fails ? -1 : result;
}

int linkat(int from, const char* path, int to, const char* name, int flags) noexcept {
    return failsHere("linkat") ? -1
                               : next<int (*)(int, const char*, int, const char*, int)>("linkat")(
                                     from, path, to, name, flags);
}

int renameat(int from, const char* path, int to, const char* name) noexcept {
    return failsHere("renameat") ? -1
                                 : next<int (*)(int, const char*, int, const char*)>("renameat")(
                                       from, path, to, name);
}

int unlinkat(int directory, const char* path, int flags) noexcept {
    return failsHere("unlinkat")
               ? -1
               : next<int (*)(int, const char*, int)>("unlinkat")(directory, path, flags);
}

}  // extern "C"
