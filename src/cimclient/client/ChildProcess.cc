#include "client/ChildProcess.h"

#include <Pegasus/Common/Exception.h>
#include <fcntl.h>
#include <poll.h>
#include <sys/resource.h>
#include <sys/syscall.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <csignal>
#include <cstring>
#include <system_error>

#include "client/WireText.h"

namespace Pegasus {

namespace {

constexpr int kConnectionNumber = 3;
constexpr int kReportNumber = 4;
// Above every number that the child gives a meaning, so that no move overwrites another's source.
constexpr int kFirstSafeNumber = 10;
constexpr int kWaitForEndMilliseconds = 1000;
constexpr int kWaitForSignalMilliseconds = 500;

CannotConnectException cannotStart(const std::string& program, int error) {
    return CannotConnectException(
        printableText("Cannot start " + program + ": " + std::generic_category().message(error)));
}

FileDescriptor movedUp(const FileDescriptor& descriptor) {
    return FileDescriptor(::fcntl(descriptor.get(), F_DUPFD_CLOEXEC, kFirstSafeNumber));
}

// From here to childMain: only calls that are safe between fork and exec of a threaded program.

void closeFrom(unsigned int first) {
#ifdef SYS_close_range
    if (::syscall(SYS_close_range, first, ~0U, 0U) == 0) {
        return;
    }
#endif
    rlimit limit{};
    ::getrlimit(RLIMIT_NOFILE, &limit);
    for (rlim_t number = first; number < limit.rlim_cur; ++number) {
        ::close(static_cast<int>(number));
    }
}

void resetSignals() {
    for (int number = 1; number < NSIG; ++number) {
        ::signal(number, SIG_DFL);
    }
    sigset_t none;
    sigemptyset(&none);
    ::sigprocmask(SIG_SETMASK, &none, nullptr);
}

struct ChildPlan {
    const char* program;
    char* const* arguments;
    char* const* environment;
    int nullDevice;
    int connection;
    int report;  // takes the errno of a failure; closed by a successful exec
};

[[noreturn]] void childMain(const ChildPlan& plan) {
    resetSignals();
    const bool placed = ::dup2(plan.nullDevice, STDIN_FILENO) >= 0 &&
                        ::dup2(plan.nullDevice, STDOUT_FILENO) >= 0 &&
                        ::dup2(plan.nullDevice, STDERR_FILENO) >= 0 &&
                        ::dup2(plan.connection, kConnectionNumber) >= 0 &&
                        ::dup3(plan.report, kReportNumber, O_CLOEXEC) >= 0;
    int report = plan.report;
    if (placed) {
        report = kReportNumber;
        closeFrom(kReportNumber + 1);
        ::execve(plan.program, plan.arguments, plan.environment);
    }
    const int error = errno;
    const ssize_t written = ::write(report, &error, sizeof(error));
    ::_exit(written == sizeof(error) ? 126 : 127);
}

// The errno that the child reports, 0 when it runs its program, ETIMEDOUT at the deadline.
int awaitStart(const FileDescriptor& report, const Deadline& deadline) {
    for (;;) {
        pollfd descriptor = {report.get(), POLLIN, 0};
        const int ready = ::poll(&descriptor, 1, deadline.millisecondsLeft());
        if (ready == 0) {
            return ETIMEDOUT;
        }
        int error = 0;
        const ssize_t count = ready < 0 ? -1 : ::read(report.get(), &error, sizeof(error));
        if (count == sizeof(error)) {
            return error;
        }
        if (count >= 0) {
            return 0;
        }
        if (errno != EINTR) {
            return errno;
        }
    }
}

}  // namespace

ChildProcess::ChildProcess(const std::string& program, FileDescriptor connection,
                           const Deadline& deadline) {
    std::array<int, 2> ends = {-1, -1};
    if (::pipe2(ends.data(), O_CLOEXEC) != 0) {
        throw cannotStart(program, errno);
    }
    const FileDescriptor reportReader(ends[0]);
    FileDescriptor reportWriter(ends[1]);
    FileDescriptor safeReport = movedUp(reportWriter);
    reportWriter.reset();
    FileDescriptor safeConnection = movedUp(connection);
    connection.reset();
    const FileDescriptor nullDevice =
        movedUp(FileDescriptor(::open("/dev/null", O_RDWR | O_CLOEXEC)));
    if (!safeReport.isOpen() || !safeConnection.isOpen() || !nullDevice.isOpen()) {
        throw cannotStart(program, errno);
    }

    std::string programText = program;
    std::string option = "--fd";
    std::string number = std::to_string(kConnectionNumber);
    std::string path = "PATH=/usr/sbin:/usr/bin:/sbin:/bin";
    const std::array<char*, 4> arguments = {programText.data(), option.data(), number.data(),
                                            nullptr};
    const std::array<char*, 2> environment = {path.data(), nullptr};
    const ChildPlan plan = {program.c_str(),  arguments.data(),     environment.data(),
                            nullDevice.get(), safeConnection.get(), safeReport.get()};
    id_ = ::fork();
    if (id_ == 0) {
        childMain(plan);
    }
    if (id_ < 0) {
        throw cannotStart(program, errno);
    }
    safeReport.reset();
    safeConnection.reset();
    const int error = awaitStart(reportReader, deadline);
    if (error == 0) {
        return;
    }
    ::kill(id_, SIGKILL);
    ::waitpid(id_, nullptr, 0);
    if (error == ETIMEDOUT) {
        throw ConnectionTimeoutException(
            printableText("No answer from " + program + " within the time-out"));
    }
    throw cannotStart(program, error);
}

ChildProcess::~ChildProcess() {
    if (endsWithin(kWaitForEndMilliseconds)) {
        return;
    }
    ::kill(id_, SIGTERM);
    if (endsWithin(kWaitForSignalMilliseconds)) {
        return;
    }
    ::kill(id_, SIGKILL);
    while (::waitpid(id_, nullptr, 0) < 0 && errno == EINTR) {
    }
}

bool ChildProcess::endsWithin(int milliseconds) const {
    int pause = 1;
    for (int waited = 0;; waited += pause) {
        const pid_t ended = ::waitpid(id_, nullptr, WNOHANG);
        // Somebody else may have taken the status: then its number may be another process by now.
        if (ended == id_ || (ended < 0 && errno == ECHILD)) {
            return true;
        }
        if (waited >= milliseconds) {
            return false;
        }
        pause = std::min(pause * 2, 20);
        ::poll(nullptr, 0, pause);
    }
}

}  // namespace Pegasus
