#include "process/ProcessGuards.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <csignal>
#include <cstring>
#include <initializer_list>
#include <new>

namespace {

const char* programName = "";

void writeToStandardError(const char* text) {
    // Nobody is left to tell when that fails.
    [[maybe_unused]] const ssize_t written = ::write(STDERR_FILENO, text, std::strlen(text));
}

[[noreturn]] void endForLackOfMemory() {
    writeToStandardError(programName);
    writeToStandardError(": not enough memory\n");
    ::_exit(1);
}

}  // namespace

bool holdStandardStreams() {
    for (const int stream : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO}) {
        // Those below are open, so the lowest free number is this one.
        if (::fcntl(stream, F_GETFD) < 0 && ::open("/dev/null", O_RDWR) != stream) {
            return false;
        }
    }
    return true;
}

void outliveFileSizeLimit() {
    std::signal(SIGXFSZ, SIG_IGN);
}

void keepOthersFromWriting() {
    const mode_t mask = ::umask(S_IWOTH);
    ::umask(mask | S_IWOTH);
}

void endWhenMemoryIsShort(const char* program) {
    programName = program;
    std::set_new_handler(&endForLackOfMemory);
}
