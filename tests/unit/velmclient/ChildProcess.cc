#include "ChildProcess.h"

#include <sys/wait.h>
#include <unistd.h>

#include <stdexcept>

#ifdef SENNET_COVERAGE
extern "C" void __gcov_dump();
#endif

namespace {

// Ends the process without what exit does for the parent's objects; line counts are saved.
[[noreturn]] void leave(bool success) {
#ifdef SENNET_COVERAGE
    __gcov_dump();
#endif
    ::_exit(success ? 0 : 1);
}

}  // namespace

std::string runInChild(const std::function<std::string()>& body) {
    int ends[2];
    if (::pipe(ends) != 0) {
        throw std::runtime_error("no pipe");
    }
    const pid_t child = ::fork();
    if (child < 0) {
        throw std::runtime_error("no child");
    }
    if (child == 0) {
        const std::string result = body();
        const bool sent =
            ::write(ends[1], result.data(), result.size()) == static_cast<ssize_t>(result.size());
        leave(sent);
    }
    ::close(ends[1]);
    std::string result;
    char buffer[4096];
    for (ssize_t count = 0; (count = ::read(ends[0], buffer, sizeof buffer)) > 0;) {
        result.append(buffer, static_cast<std::size_t>(count));
    }
    ::close(ends[0]);
    int status = 0;
    ::waitpid(child, &status, 0);
    return WIFEXITED(status) && WEXITSTATUS(status) == 0 ? result : "child failed";
}
