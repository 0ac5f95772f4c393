#include "service/EndDeadline.h"

#include <unistd.h>

#include <csignal>
#include <string_view>

namespace cimomd {
namespace {

// Nothing else is safe in a handler: the thread that hangs may hold any lock.
void endAtOnce(int) {
    constexpr std::string_view kMessage = "cimomd: ends although a source has not answered yet\n";
    static_cast<void>(::write(STDERR_FILENO, kMessage.data(), kMessage.size()) > 0);
    ::_exit(0);
}

}  // namespace

EndDeadline::EndDeadline(unsigned seconds) {
    std::signal(SIGALRM, endAtOnce);
    // Whoever started the program may have blocked it.
    sigset_t alarms;
    sigemptyset(&alarms);
    sigaddset(&alarms, SIGALRM);
    ::pthread_sigmask(SIG_UNBLOCK, &alarms, nullptr);
    ::alarm(seconds);
}

EndDeadline::~EndDeadline() {
    ::alarm(0);
    std::signal(SIGALRM, SIG_DFL);
}

}  // namespace cimomd
