#include "system/BoundedCommand.h"

#include <fcntl.h>
#include <poll.h>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <csignal>
#include <stdexcept>
#include <thread>

#include "files/TextFile.h"
#include "system/ForkedChild.h"

namespace cimomd {
namespace {

using Clock = std::chrono::steady_clock;

class Pipe {
  public:
    Pipe() {
        if (::pipe2(ends.data(), O_CLOEXEC) != 0)
            throw std::runtime_error("there are no descriptors left for a pipe");
    }
    ~Pipe() {
        ::close(ends[0]);
        closeWriteEnd();
    }
    Pipe(const Pipe&) = delete;
    Pipe& operator=(const Pipe&) = delete;

    int readEnd() const { return ends[0]; }
    int writeEnd() const { return ends[1]; }
    void closeWriteEnd() {
        if (ends[1] >= 0)
            ::close(ends[1]);
        ends[1] = -1;
    }

  private:
    std::array<int, 2> ends{-1, -1};
};

/// What the child needs, made before it is forked.
struct Start {
    const char* program;
    char* const* arguments;
    char* const* environment;
    int output;
    /// Where it tells why it cannot start; closes by itself when it can.
    int errors;
    pid_t parent;
};

// From here to runProgram: only calls that are safe between fork and exec of a threaded program.

void resetSignals() {
    struct sigaction standard {};
    standard.sa_handler = SIG_DFL;
    for (int number = 1; number < NSIG; ++number)
        ::sigaction(number, &standard, nullptr);
    sigset_t none;
    ::sigemptyset(&none);
    ::sigprocmask(SIG_SETMASK, &none, nullptr);
}

bool setStandardStreams(int output) {
    const int nothing = ::open("/dev/null", O_RDWR | O_CLOEXEC);
    return nothing >= 0 && ::dup2(nothing, STDIN_FILENO) >= 0 &&
           ::dup2(output, STDOUT_FILENO) >= 0 && ::dup2(nothing, STDERR_FILENO) >= 0;
}

[[noreturn]] void runProgram(const Start& start) {
    ::setpgid(0, 0);
    // A program that hangs must not outlive a process that is killed while it waits for it.
    ::prctl(PR_SET_PDEATHSIG, SIGKILL);
    if (::getppid() == start.parent && setStandardStreams(start.output)) {
        closeOthers(STDERR_FILENO + 1, static_cast<unsigned int>(start.errors));
        resetSignals();
        ::execve(start.program, start.arguments, start.environment);
    }
    const int error = errno;
    static_cast<void>(::write(start.errors, &error, sizeof error) == sizeof error);
    ::_exit(1);
}

/// Zero or an error number. The child leads a process group of its own.
int spawn(const std::filesystem::path& program, const std::vector<std::string>& arguments,
          int output, pid_t& child) {
    std::vector<std::string> words{program.string()};
    words.insert(words.end(), arguments.begin(), arguments.end());
    std::vector<char*> argumentList;
    argumentList.reserve(words.size() + 1);
    for (std::string& word : words)
        argumentList.push_back(word.data());
    argumentList.push_back(nullptr);
    std::string locale = "LC_ALL=C";
    const std::array<char*, 2> environment{locale.data(), nullptr};
    Pipe errors;
    const Start start{program.c_str(), argumentList.data(), environment.data(),
                      output,          errors.writeEnd(),   ::getpid()};
    child = ::fork();
    if (child < 0)
        return errno;
    if (child == 0)
        runProgram(start);
    errors.closeWriteEnd();
    int error = 0;
    ssize_t count = 0;
    while ((count = ::read(errors.readEnd(), &error, sizeof error)) < 0 && errno == EINTR) {
    }
    if (count <= 0)
        return 0;
    while (::waitpid(child, nullptr, 0) < 0 && errno == EINTR) {
    }
    return error;
}

/// A running child; it and all it started are gone when this is.
class Child {
  public:
    explicit Child(pid_t child) : id(child) {}
    ~Child() {
        // Before the child is waited for its number, and so the group's, cannot be another's.
        ::kill(-id, SIGKILL);
        while (::waitpid(id, nullptr, 0) < 0 && errno == EINTR) {
        }
    }
    Child(const Child&) = delete;
    Child& operator=(const Child&) = delete;

    /// Whether it ended with status 0; Absence::TimedOut when it does not end at all.
    Fact<bool> succeeds(Clock::time_point deadline) const {
        constexpr std::chrono::milliseconds kPause(2);
        siginfo_t info{};
        while (::waitid(P_PID, static_cast<id_t>(id), &info, WEXITED | WNOHANG | WNOWAIT) == 0) {
            if (info.si_pid == id)
                return info.si_code == CLD_EXITED && info.si_status == 0;
            if (Clock::now() >= deadline)
                return Absence::TimedOut;
            std::this_thread::sleep_for(kPause);
        }
        return false;
    }

  private:
    pid_t id;
};

/// Everything up to the end of `descriptor`.
Fact<std::string> readUntil(Clock::time_point deadline, int descriptor, std::size_t maxBytes) {
    std::string output;
    std::array<char, 65536> buffer;
    while (true) {
        const auto left =
            std::chrono::duration_cast<std::chrono::milliseconds>(deadline - Clock::now()).count();
        pollfd waiting{descriptor, POLLIN, 0};
        const int ready = left > 0 ? ::poll(&waiting, 1, static_cast<int>(left)) : 0;
        if (ready == 0)
            return Absence::TimedOut;
        const ssize_t count = ready > 0 ? ::read(descriptor, buffer.data(), buffer.size()) : -1;
        if (count == 0)
            return output;
        if (count < 0 && errno != EINTR)
            return Absence::Unreadable;
        if (count > 0)
            output.append(buffer.data(), static_cast<std::size_t>(count));
        if (output.size() > maxBytes)
            return Absence::Unreadable;
    }
}

}  // namespace

Fact<std::string> outputOf(const std::filesystem::path& program,
                           const std::vector<std::string>& arguments, const CommandLimits& limits) {
    if (!program.is_absolute())
        throw std::logic_error("a program is named by its absolute path: " + program.string());
    const Clock::time_point deadline = Clock::now() + limits.deadline;
    Pipe pipe;
    pid_t id = 0;
    const int error = spawn(program, arguments, pipe.writeEnd(), id);
    if (error != 0)
        return absenceOf(std::error_code(error, std::generic_category()));
    const Child child(id);
    pipe.closeWriteEnd();
    Fact<std::string> output = readUntil(deadline, pipe.readEnd(), limits.maxOutputBytes);
    if (!output)
        return output;
    const Fact<bool> succeeded = child.succeeds(deadline);
    if (!succeeded)
        return succeeded.reason();
    return *succeeded ? output : Absence::Unreadable;
}

}  // namespace cimomd
