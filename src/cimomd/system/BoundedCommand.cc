#include "system/BoundedCommand.h"

#include <fcntl.h>
#include <poll.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <csignal>
#include <stdexcept>
#include <thread>

#include "files/TextFile.h"

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

/// How the child starts: a process group of its own, no signal blocked or ignored, no descriptor
/// but the three standard ones.
class SpawnSettings {
  public:
    explicit SpawnSettings(int output) {
        ::posix_spawn_file_actions_init(&actions);
        ::posix_spawn_file_actions_addopen(&actions, STDIN_FILENO, "/dev/null", O_RDONLY, 0);
        ::posix_spawn_file_actions_adddup2(&actions, output, STDOUT_FILENO);
        ::posix_spawn_file_actions_addopen(&actions, STDERR_FILENO, "/dev/null", O_WRONLY, 0);
        ::posix_spawn_file_actions_addclosefrom_np(&actions, STDERR_FILENO + 1);
        ::posix_spawnattr_init(&attributes);
        sigset_t signals;
        ::sigfillset(&signals);
        ::posix_spawnattr_setsigdefault(&attributes, &signals);
        ::sigemptyset(&signals);
        ::posix_spawnattr_setsigmask(&attributes, &signals);
        ::posix_spawnattr_setpgroup(&attributes, 0);
        ::posix_spawnattr_setflags(
            &attributes, POSIX_SPAWN_SETPGROUP | POSIX_SPAWN_SETSIGMASK | POSIX_SPAWN_SETSIGDEF);
    }
    ~SpawnSettings() {
        ::posix_spawnattr_destroy(&attributes);
        ::posix_spawn_file_actions_destroy(&actions);
    }
    SpawnSettings(const SpawnSettings&) = delete;
    SpawnSettings& operator=(const SpawnSettings&) = delete;

    /// Zero or an error number.
    int spawn(const std::filesystem::path& program, const std::vector<std::string>& arguments,
              pid_t& child) const {
        std::vector<std::string> words{program.string()};
        words.insert(words.end(), arguments.begin(), arguments.end());
        std::vector<char*> argumentList;
        argumentList.reserve(words.size() + 1);
        for (std::string& word : words)
            argumentList.push_back(word.data());
        argumentList.push_back(nullptr);
        std::string locale = "LC_ALL=C";
        std::array<char*, 2> environment{locale.data(), nullptr};
        return ::posix_spawn(&child, program.c_str(), &actions, &attributes, argumentList.data(),
                             environment.data());
    }

  private:
    posix_spawn_file_actions_t actions{};
    posix_spawnattr_t attributes{};
};

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
    const int error = SpawnSettings(pipe.writeEnd()).spawn(program, arguments, id);
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
