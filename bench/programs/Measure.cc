// What a program costs: started from a small process, so that its peak of memory is its own and not
// that of the process it was forked from.
//
//   measure FILE PROGRAM [ARGUMENT]...
//
// Writes into FILE one line: seconds of CPU in user mode and in the kernel, both with all
// descendants; seconds from start to end; peak of resident memory of the largest process in KiB.
// The exit status is the program's, as a shell tells it.

#include <sys/prctl.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <cstdio>

namespace {

using Clock = std::chrono::steady_clock;

constexpr int kSignalled = 128;

double seconds(const timeval& time) {
    return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_usec) / 1e6;
}

}  // namespace

int main(int argc, char** argv) {
    if (argc < 3) {
        std::fputs("usage: measure FILE PROGRAM [ARGUMENT]...\n", stderr);
        return 2;
    }
    // Descendants that outlive their parents become children of this process and are counted.
    ::prctl(PR_SET_CHILD_SUBREAPER, 1);
    const auto begin = Clock::now();
    const pid_t child = ::fork();
    if (child == 0) {
        ::execvp(argv[2], argv + 2);
        std::perror(argv[2]);
        ::_exit(127);
    }
    int status = 0;
    ::waitpid(child, &status, 0);
    const std::chrono::duration<double> wall = Clock::now() - begin;
    while (::wait(nullptr) > 0) {
    }
    rusage usage{};
    ::getrusage(RUSAGE_CHILDREN, &usage);
    std::FILE* file = std::fopen(argv[1], "w");
    if (file == nullptr) {
        std::perror(argv[1]);
        return 2;
    }
    std::fprintf(file, "%.6f %.6f %.6f %ld\n", seconds(usage.ru_utime), seconds(usage.ru_stime),
                 wall.count(), usage.ru_maxrss);
    std::fclose(file);
    return WIFEXITED(status) ? WEXITSTATUS(status) : kSignalled + WTERMSIG(status);
}
