#include "service/Signals.h"

#include <sys/signalfd.h>
#include <unistd.h>

#include <stdexcept>

namespace cimomd {

Signals::Signals() {
    sigset_t mask;
    sigemptyset(&mask);
    sigaddset(&mask, SIGTERM);
    sigaddset(&mask, SIGINT);
    sigaddset(&mask, SIGHUP);
    ::pthread_sigmask(SIG_BLOCK, &mask, &previousMask);
    signals = ::signalfd(-1, &mask, SFD_CLOEXEC | SFD_NONBLOCK);
    if (signals < 0)
        throw std::runtime_error("no descriptor to wait for signals with");
}

Signals::~Signals() {
    // A signal left pending would strike when the mask is put back.
    while (next() != Event::None) {
    }
    ::close(signals);
    ::pthread_sigmask(SIG_SETMASK, &previousMask, nullptr);
}

Signals::Event Signals::next() {
    signalfd_siginfo info{};
    if (::read(signals, &info, sizeof info) != sizeof info)
        return Event::None;
    return info.ssi_signo == SIGHUP ? Event::Reload : Event::Stop;
}

}  // namespace cimomd
