#include "integration/sennet/BackgroundProgram.h"

#include <poll.h>
#include <signal.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <stdexcept>
#include <vector>

BackgroundProgram::BackgroundProgram(const std::string& program, const std::string& argument,
                                     const std::map<std::string, std::string>& environment) {
    int ends[2];
    if (pipe(ends) != 0) {
        throw std::runtime_error("no pipe");
    }
    output = ends[0];
    posix_spawn_file_actions_t actions;
    posix_spawn_file_actions_init(&actions);
    posix_spawn_file_actions_adddup2(&actions, ends[1], STDOUT_FILENO);
    posix_spawn_file_actions_addclose(&actions, ends[0]);
    posix_spawn_file_actions_addclose(&actions, ends[1]);

    std::vector<std::string> settings;
    for (const auto& [name, value] : environment) {
        settings.push_back(name + "=" + value);
    }
    std::vector<char*> settingPointers;
    for (std::string& setting : settings) {
        settingPointers.push_back(setting.data());
    }
    settingPointers.push_back(nullptr);
    std::string programText = program;
    std::string argumentText = argument;
    char* arguments[] = {programText.data(), argumentText.data(), nullptr};

    const int error = posix_spawn(&process, program.c_str(), &actions, nullptr, arguments,
                                  settingPointers.data());
    posix_spawn_file_actions_destroy(&actions);
    close(ends[1]);
    if (error != 0) {
        close(output);
        throw std::runtime_error("cannot start " + program);
    }
}

BackgroundProgram::~BackgroundProgram() {
    kill();
    close(output);
}

std::string BackgroundProgram::readUntil(const std::string& text, std::chrono::milliseconds limit) {
    const auto deadline = std::chrono::steady_clock::now() + limit;
    while (seen != text) {
        const auto left = std::chrono::duration_cast<std::chrono::milliseconds>(
            deadline - std::chrono::steady_clock::now());
        pollfd ready{output, POLLIN, 0};
        if (left.count() <= 0 || poll(&ready, 1, static_cast<int>(left.count())) <= 0) {
            break;
        }
        char buffer[4096];
        const ssize_t count = read(output, buffer, sizeof buffer);
        if (count <= 0) {
            break;
        }
        seen.append(buffer, static_cast<size_t>(count));
    }
    return seen;
}

void BackgroundProgram::kill() {
    if (process > 0) {
        ::kill(process, SIGKILL);
        waitpid(process, nullptr, 0);
        process = -1;
    }
}
