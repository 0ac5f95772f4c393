#pragma once

// Memory of who did not answer: a disk's server, a driver, a process. It is left alone for a while,
// so that not every request waits for it again.

#include <sys/types.h>

#include <chrono>
#include <cstddef>
#include <map>
#include <mutex>
#include <string>
#include <vector>

namespace cimomd {

struct SilenceLimits {
    /// How long an answer is waited for.
    std::chrono::milliseconds deadline{2000};
    /// How long a source that did not answer is left alone.
    std::chrono::milliseconds retryAfter{60000};
    /// While so many do not answer, no other is asked: it bounds the time of one enumeration and
    /// the number of children that even SIGKILL does not end.
    std::size_t maxSilent = 5;
};

/// May be used from several threads at once.
class SilentSources {
  public:
    explicit SilentSources(const SilenceLimits& bounds) : limits(bounds) {}
    SilentSources(const SilentSources&) = delete;
    SilentSources& operator=(const SilentSources&) = delete;

    std::chrono::milliseconds deadline() const { return limits.deadline; }

    /// Whether `source` may be asked: false when it, or too many others, did not answer before.
    bool mayAsk(const std::string& source);
    /// To be called when `source` did not answer before the deadline.
    void note(const std::string& source);
    /// Kills a child process. One that does not go at once is waited for later.
    void end(pid_t child);

  private:
    using Clock = std::chrono::steady_clock;

    SilenceLimits limits;
    std::mutex mutex;
    /// When a silent source may be asked again.
    std::map<std::string, Clock::time_point> retryTimes;
    /// Killed, but not gone yet.
    std::vector<pid_t> stuck;
};

}  // namespace cimomd
