#pragma once

// How long the program may take to end: a source that does not answer, a driver or a server of
// files, keeps the thread that asks it for as long as it likes.

namespace cimomd {

/// While it lives the time runs; after `seconds` the process ends with status 0 and a message, as
/// somebody told it to stop. Only one at a time; it takes SIGALRM.
class EndDeadline {
  public:
    explicit EndDeadline(unsigned seconds);
    ~EndDeadline();
    EndDeadline(const EndDeadline&) = delete;
    EndDeadline& operator=(const EndDeadline&) = delete;
};

}  // namespace cimomd
