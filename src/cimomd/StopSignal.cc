#include "StopSignal.h"

#include <poll.h>
#include <sys/eventfd.h>
#include <sys/signalfd.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstdint>
#include <stdexcept>

namespace cimomd {

StopSignal::StopSignal() {
    sigset_t mask;
    sigemptyset(&mask);
    sigaddset(&mask, SIGTERM);
    sigaddset(&mask, SIGINT);
    ::pthread_sigmask(SIG_BLOCK, &mask, &previousMask);
    signals = ::signalfd(-1, &mask, SFD_CLOEXEC);
    requests = ::eventfd(0, EFD_CLOEXEC);
    if (signals < 0 || requests < 0)
        throw std::runtime_error("no descriptors to wait for signals with");
}

StopSignal::~StopSignal() {
    ::close(signals);
    ::close(requests);
    ::pthread_sigmask(SIG_SETMASK, &previousMask, nullptr);
}

void StopSignal::request() {
    const std::uint64_t one = 1;
    static_cast<void>(::write(requests, &one, sizeof one) == sizeof one);
}

void StopSignal::wait() {
    std::array<pollfd, 2> descriptors{{{signals, POLLIN, 0}, {requests, POLLIN, 0}}};
    while (::poll(descriptors.data(), descriptors.size(), -1) < 0 && errno == EINTR) {
    }
    // A signal left pending would strike when the mask is put back.
    signalfd_siginfo info{};
    if ((descriptors[0].revents & POLLIN) != 0)
        static_cast<void>(::read(signals, &info, sizeof info) == sizeof info);
}

}  // namespace cimomd
