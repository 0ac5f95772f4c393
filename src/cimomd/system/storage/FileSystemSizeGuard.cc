#include "system/storage/FileSystemSizeGuard.h"

#include <fcntl.h>
#include <poll.h>
#include <sys/prctl.h>
#include <sys/statfs.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <csignal>
#include <thread>

namespace cimomd {
namespace {

using std::chrono::milliseconds;
using std::chrono::steady_clock;

constexpr milliseconds kTimeToDie{100};

/// What the child writes: less than a pipe takes in one piece.
struct Answer {
    int error = 0;
    FileSystemSize size;
};

// From here to childMain: only calls that are safe between fork and exec of a threaded program.

void closeRange(unsigned int first, unsigned int last) {
    if (::close_range(first, last, 0) == 0)
        return;
    constexpr unsigned int kUsualLimit = 65536;
    for (unsigned int number = first; number <= std::min(last, kUsualLimit); ++number)
        ::close(static_cast<int>(number));
}

/// A child that hangs must keep nobody waiting for the end of a connection or of an output.
void closeAllBut(unsigned int kept) {
    if (kept > 0)
        closeRange(0, kept - 1);
    closeRange(kept + 1, ~0U);
}

[[noreturn]] void childMain(FileSystemSizeGuard::Call call, const char* mountPoint, int answers) {
    ::prctl(PR_SET_PDEATHSIG, SIGKILL);
    closeAllBut(static_cast<unsigned int>(answers));
    Answer answer;
    answer.error = call(mountPoint, answer.size);
    const bool wasWritten = ::write(answers, &answer, sizeof answer) == sizeof answer;
    ::_exit(wasWritten ? 0 : 1);
}

/// Waits until an answer, or the end of the child, can be read; false when the time is over.
bool waitReadable(int descriptor, milliseconds time) {
    const auto end = steady_clock::now() + time;
    while (true) {
        const auto left = std::chrono::ceil<milliseconds>(end - steady_clock::now());
        pollfd entry{descriptor, POLLIN, 0};
        const int count =
            ::poll(&entry, 1, static_cast<int>(std::max(left, milliseconds(0)).count()));
        if (count >= 0 || errno != EINTR)
            return count > 0;
    }
}

Fact<FileSystemSize> readAnswer(int descriptor) {
    Answer answer;
    ssize_t count = 0;
    do {
        count = ::read(descriptor, &answer, sizeof answer);
    } while (count < 0 && errno == EINTR);
    if (count != sizeof answer)
        return Absence::Unreadable;
    if (answer.error != 0)
        return absenceOfSize(answer.error);
    return answer.size;
}

/// Whether the child is gone, or none of ours.
bool isReaped(pid_t child) {
    const pid_t ended = ::waitpid(child, nullptr, WNOHANG);
    return ended == child || (ended < 0 && errno == ECHILD);
}

}  // namespace

int readFileSystemSize(const char* mountPoint, FileSystemSize& size) {
    struct statfs status {};
    if (::statfs(mountPoint, &status) != 0)
        return errno;
    const auto fragment = status.f_frsize != 0 ? status.f_frsize : status.f_bsize;
    size = {static_cast<std::uint64_t>(fragment), status.f_blocks, status.f_bavail, status.f_files,
            status.f_ffree};
    return 0;
}

Absence absenceOfSize(int error) {
    if (error == EACCES || error == EPERM)
        return Absence::NeedsRoot;
    if (error == ENOENT || error == ENOTDIR)
        return Absence::Absent;
    return error == ETIMEDOUT ? Absence::TimedOut : Absence::Unreadable;
}

Fact<FileSystemSize> FileSystemSizeGuard::ask(const std::string& device,
                                              const std::string& mountPoint) {
    if (!mayAsk(device))
        return Absence::TimedOut;
    std::array<int, 2> ends{};
    if (::pipe2(ends.data(), O_CLOEXEC) != 0)
        return Absence::Unreadable;
    const char* const path = mountPoint.c_str();
    const pid_t child = ::fork();
    if (child == 0)
        childMain(call, path, ends[1]);
    ::close(ends[1]);
    Fact<FileSystemSize> size = Absence::Unreadable;
    if (child > 0) {
        const bool hasAnswered = waitReadable(ends[0], limits.deadline);
        size = hasAnswered ? readAnswer(ends[0]) : Absence::TimedOut;
        if (!hasAnswered)
            noteSilence(device);
        end(child);
    }
    ::close(ends[0]);
    return size;
}

bool FileSystemSizeGuard::mayAsk(const std::string& device) {
    const std::lock_guard lock(mutex);
    stuck.erase(std::remove_if(stuck.begin(), stuck.end(), isReaped), stuck.end());
    const auto now = Clock::now();
    for (auto entry = retryTimes.begin(); entry != retryTimes.end();)
        entry = entry->second <= now ? retryTimes.erase(entry) : std::next(entry);
    return retryTimes.count(device) == 0 &&
           std::max(retryTimes.size(), stuck.size()) < limits.maxSilent;
}

void FileSystemSizeGuard::noteSilence(const std::string& device) {
    const std::lock_guard lock(mutex);
    retryTimes[device] = Clock::now() + limits.retryAfter;
}

void FileSystemSizeGuard::end(pid_t child) {
    ::kill(child, SIGKILL);
    const auto giveUp = Clock::now() + kTimeToDie;
    while (!isReaped(child)) {
        if (Clock::now() >= giveUp) {
            const std::lock_guard lock(mutex);
            stuck.push_back(child);
            return;
        }
        std::this_thread::sleep_for(milliseconds(1));
    }
}

}  // namespace cimomd
