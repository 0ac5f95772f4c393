#pragma once

// Tells the log who connects, without letting who connects again and again fill it.

#include <chrono>
#include <functional>
#include <string_view>
#include <utility>

namespace cimomd {

class ConnectionLog {
  public:
    using Clock = std::chrono::steady_clock;
    using Write = std::function<void(std::string_view line)>;

    /// Lines of connections in one second; it starts with the first of them.
    static constexpr unsigned kLinesASecond = 10;

    explicit ConnectionLog(Write writeLine) : write(std::move(writeLine)) {}

    /// Writes `line`, or counts it when this second has had its lines. `now` never goes back.
    void add(std::string_view line, Clock::time_point now);

    /// Writes how many lines were left out, once their second is over. To be called from time to
    /// time, for there may be no further connection.
    void tellLeftOut(Clock::time_point now);

  private:
    Write write;
    Clock::time_point begin{};
    unsigned written = 0;
    unsigned long long leftOut = 0;
};

}  // namespace cimomd
