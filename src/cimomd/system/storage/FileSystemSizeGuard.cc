#include "system/storage/FileSystemSizeGuard.h"

#include <sys/statfs.h>

#include <cerrno>
#include <cstdint>

#include "system/GuardedChild.h"

namespace cimomd {
namespace {

struct Question {
    FileSystemSizeGuard::Call call;
    const char* mountPoint;
};

struct Answer {
    std::int64_t error = 0;
    FileSystemSize size;
};

void answerQuestion(const void* asked, int answers) {
    const Question& question = *static_cast<const Question*>(asked);
    Answer answer;
    answer.error = question.call(question.mountPoint, answer.size);
    writeAnswer(answers, answer);
}

}  // namespace

int readFileSystemSize(const char* mountPoint, FileSystemSize& size) {
    struct statfs status {};
    if (::statfs(mountPoint, &status) != 0)
        return errno;
    const auto fragment = status.f_frsize != 0 ? status.f_frsize : status.f_bsize;
    // What FUSE answers for a file system that its owner keeps for himself, even from root.
    if (fragment == 0)
        return ENODATA;
    size = {static_cast<std::uint64_t>(fragment), status.f_blocks, status.f_bavail, status.f_files,
            status.f_ffree};
    return 0;
}

Absence absenceOfSize(int error) {
    if (error == EACCES || error == EPERM)
        return Absence::NeedsRoot;
    if (error == ENOENT || error == ENOTDIR || error == ENODATA)
        return Absence::Absent;
    return error == ETIMEDOUT ? Absence::TimedOut : Absence::Unreadable;
}

Fact<FileSystemSize> FileSystemSizeGuard::ask(const std::string& device,
                                              const std::string& mountPoint) {
    const Question question{call, mountPoint.c_str()};
    Answer answer;
    const auto absence =
        askGuarded(silent, device, answerQuestion, &question, &answer, sizeof answer);
    if (absence)
        return *absence;
    if (answer.error != 0)
        return absenceOfSize(static_cast<int>(answer.error));
    return answer.size;
}

}  // namespace cimomd
