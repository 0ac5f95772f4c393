#include "support/RunProgram.h"

#include <fcntl.h>
#include <poll.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <csignal>
#include <cstring>
#include <stdexcept>

namespace support {

namespace {

using Clock = std::chrono::steady_clock;

struct Pipe {
    int readEnd = -1;
    int writeEnd = -1;

    Pipe() {
        std::array<int, 2> ends{};
        if (pipe2(ends.data(), O_CLOEXEC) != 0) {
            throw std::runtime_error("cannot make a pipe");
        }
        readEnd = ends[0];
        writeEnd = ends[1];
    }
    ~Pipe() {
        close(readEnd);
        closeWriteEnd();
    }
    Pipe(const Pipe&) = delete;
    Pipe& operator=(const Pipe&) = delete;

    void closeWriteEnd() {
        if (writeEnd >= 0) {
            close(writeEnd);
            writeEnd = -1;
        }
    }
};

std::vector<char*> pointersTo(std::vector<std::string>& texts) {
    std::vector<char*> pointers;
    for (std::string& text : texts) {
        pointers.push_back(text.data());
    }
    pointers.push_back(nullptr);
    return pointers;
}

pid_t start(const std::string& program, const std::vector<std::string>& arguments,
            const std::map<std::string, std::string>& environment, int out, int err) {
    std::vector<std::string> argumentTexts = {program};
    argumentTexts.insert(argumentTexts.end(), arguments.begin(), arguments.end());
    std::vector<std::string> environmentTexts;
    for (const auto& [name, value] : environment) {
        environmentTexts.push_back(name + "=" + value);
    }
    posix_spawn_file_actions_t actions;
    posix_spawn_file_actions_init(&actions);
    posix_spawn_file_actions_addopen(&actions, 0, "/dev/null", O_RDONLY, 0);
    posix_spawn_file_actions_adddup2(&actions, out, 1);
    posix_spawn_file_actions_adddup2(&actions, err, 2);
    pid_t child = -1;
    const int error =
        posix_spawn(&child, program.c_str(), &actions, nullptr, pointersTo(argumentTexts).data(),
                    pointersTo(environmentTexts).data());
    posix_spawn_file_actions_destroy(&actions);
    if (error != 0) {
        throw std::runtime_error("cannot start " + program + ": " + std::strerror(error));
    }
    return child;
}

// Appends what there is to read. False at the end of the stream.
bool drain(int descriptor, std::string& text) {
    std::array<char, 65536> buffer{};
    const ssize_t count = read(descriptor, buffer.data(), buffer.size());
    if (count <= 0) {
        return count < 0 && errno == EINTR;
    }
    text.append(buffer.data(), static_cast<std::size_t>(count));
    return true;
}

void setStatus(ProgramResult& result, int status) {
    if (WIFEXITED(status)) {
        result.exitStatus = WEXITSTATUS(status);
    } else if (WIFSIGNALED(status)) {
        result.signal = WTERMSIG(status);
    }
}

}  // namespace

ProgramResult runProgram(const std::string& program, const std::vector<std::string>& arguments,
                         const std::map<std::string, std::string>& environment,
                         std::chrono::milliseconds timeLimit) {
    Pipe out;
    Pipe err;
    const Clock::time_point end = Clock::now() + timeLimit;
    const pid_t child = start(program, arguments, environment, out.writeEnd, err.writeEnd);
    out.closeWriteEnd();
    err.closeWriteEnd();

    ProgramResult result;
    std::array<pollfd, 2> descriptors = {pollfd{out.readEnd, POLLIN, 0},
                                         pollfd{err.readEnd, POLLIN, 0}};
    while (descriptors[0].fd >= 0 || descriptors[1].fd >= 0) {
        const auto left = std::chrono::duration_cast<std::chrono::milliseconds>(end - Clock::now());
        if (left.count() <= 0) {
            result.timedOut = true;
            break;
        }
        if (poll(descriptors.data(), descriptors.size(), static_cast<int>(left.count()) + 1) <= 0) {
            continue;
        }
        if (descriptors[0].revents != 0 && !drain(out.readEnd, result.out)) {
            descriptors[0].fd = -1;
        }
        if (descriptors[1].revents != 0 && !drain(err.readEnd, result.err)) {
            descriptors[1].fd = -1;
        }
    }
    // A program may close its outputs and live on.
    int status = 0;
    while (!result.timedOut && waitpid(child, &status, WNOHANG) == 0) {
        result.timedOut = Clock::now() >= end;
        usleep(1000);
    }
    if (result.timedOut) {
        kill(child, SIGKILL);
        waitpid(child, &status, 0);
    }
    setStatus(result, status);
    return result;
}

}  // namespace support
