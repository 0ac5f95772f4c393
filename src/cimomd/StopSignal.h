#pragma once

// Waiting for the end of the program: SIGTERM, SIGINT, or a request from another thread.

#include <csignal>

namespace cimomd {

/// Make it before any thread is started: the signals must be blocked in all of them.
class StopSignal {
  public:
    /// Raises std::runtime_error when the kernel gives no descriptors.
    StopSignal();
    ~StopSignal();
    StopSignal(const StopSignal&) = delete;
    StopSignal& operator=(const StopSignal&) = delete;

    /// Ends wait; may be called from any thread.
    void request();

    /// Returns when a signal came or request was called, also when that was before.
    void wait();

  private:
    sigset_t previousMask;
    int signals = -1;
    int requests = -1;
};

}  // namespace cimomd
