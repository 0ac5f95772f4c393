#include "script/ProgramOutput.h"

#include <fcntl.h>
#include <poll.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <csignal>
#include <cstddef>

namespace sennetctl {

namespace {

/// The program's number, or -1. Its standard output goes to the descriptor.
pid_t start(std::vector<std::string>& words, int output) {
    std::vector<char*> arguments;
    arguments.reserve(words.size() + 1);
    for (std::string& word : words) {
        arguments.push_back(word.data());
    }
    arguments.push_back(nullptr);
    posix_spawn_file_actions_t actions{};
    if (::posix_spawn_file_actions_init(&actions) != 0) {
        return -1;
    }
    pid_t child = -1;
    const bool isPrepared =
        ::posix_spawn_file_actions_addopen(&actions, STDIN_FILENO, "/dev/null", O_RDONLY, 0) == 0 &&
        ::posix_spawn_file_actions_adddup2(&actions, output, STDOUT_FILENO) == 0 &&
        ::posix_spawn_file_actions_addopen(&actions, STDERR_FILENO, "/dev/null", O_WRONLY, 0) == 0;
    if (!isPrepared ||
        ::posix_spawnp(&child, arguments[0], &actions, nullptr, arguments.data(), environ) != 0) {
        child = -1;
    }
    ::posix_spawn_file_actions_destroy(&actions);
    return child;
}

/// Empty when the other end says nothing for too long.
std::string readToEnd(int input, unsigned seconds) {
    constexpr std::size_t kMostOctets = 65536;
    std::string text;
    std::array<char, 4096> buffer{};
    while (text.size() < kMostOctets) {
        pollfd waiting{input, POLLIN, 0};
        if (::poll(&waiting, 1, static_cast<int>(seconds) * 1000) <= 0) {
            return {};
        }
        const ssize_t count = ::read(input, buffer.data(), buffer.size());
        if (count <= 0) {
            break;
        }
        text.append(buffer.data(), static_cast<std::size_t>(count));
    }
    return text;
}

}  // namespace

std::string outputOf(std::vector<std::string> words, unsigned seconds) {
    std::array<int, 2> ends{};
    if (::pipe2(ends.data(), O_CLOEXEC) != 0) {
        return {};
    }
    const pid_t child = start(words, ends[1]);
    ::close(ends[1]);
    std::string text;
    if (child > 0) {
        text = readToEnd(ends[0], seconds);
        // It has nothing more to tell.
        ::kill(child, SIGKILL);
        while (::waitpid(child, nullptr, 0) < 0 && errno == EINTR) {
        }
    }
    ::close(ends[0]);
    return text;
}

}  // namespace sennetctl
