#pragma once

// The signals that a daemon is steered with, read as events: SIGTERM and SIGINT end it, SIGHUP
// makes it reload.

#include <csignal>

namespace cimomd {

/// Make it before any thread is started: the signals must be blocked in all of them.
class Signals {
  public:
    enum class Event { None, Stop, Reload };

    /// Raises std::runtime_error when the kernel gives no descriptor.
    Signals();
    ~Signals();
    Signals(const Signals&) = delete;
    Signals& operator=(const Signals&) = delete;

    /// Readable when next would not give None.
    int descriptor() const { return signals; }

    /// The next signal that came; does not wait.
    Event next();

  private:
    sigset_t previousMask;
    int signals = -1;
};

}  // namespace cimomd
