#include "system/GuardedChild.h"

#include <fcntl.h>
#include <poll.h>
#include <sys/prctl.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <csignal>

#include "system/ForkedChild.h"

namespace cimomd {
namespace {

using std::chrono::milliseconds;
using Clock = std::chrono::steady_clock;

// Only calls that are safe between fork and exec of a threaded program.
[[noreturn]] void childMain(GuardedChild::Task task, const void* question, int answers) {
    ::prctl(PR_SET_PDEATHSIG, SIGKILL);
    // A child that hangs must keep nobody waiting for the end of a connection or of an output.
    closeOthers(0, static_cast<unsigned int>(answers));
    task(question, answers);
    ::_exit(0);
}

/// Waits until an answer, or the end of the child, can be read; false when the time is over.
bool waitReadable(int descriptor, Clock::time_point end) {
    while (true) {
        const auto left = std::chrono::ceil<milliseconds>(end - Clock::now());
        pollfd entry{descriptor, POLLIN, 0};
        const int count =
            ::poll(&entry, 1, static_cast<int>(std::max(left, milliseconds(0)).count()));
        if (count >= 0 || errno != EINTR)
            return count > 0;
    }
}

}  // namespace

GuardedChild::GuardedChild(SilentSources& silentSources, Task task, const void* question)
    : sources(silentSources) {
    std::array<int, 2> ends{};
    if (::pipe2(ends.data(), O_CLOEXEC) != 0)
        return;
    answers = ends[0];
    child = ::fork();
    if (child == 0)
        childMain(task, question, ends[1]);
    ::close(ends[1]);
}

GuardedChild::~GuardedChild() {
    if (child > 0)
        sources.end(child);
    if (answers >= 0)
        ::close(answers);
}

GuardedChild::Reading GuardedChild::read(void* bytes, std::size_t size) const {
    if (child <= 0)
        return Reading::Ended;
    const auto end = Clock::now() + sources.deadline();
    std::size_t length = 0;
    while (length < size) {
        if (!waitReadable(answers, end))
            return Reading::Silent;
        const ssize_t count = ::read(answers, static_cast<char*>(bytes) + length, size - length);
        if (count == 0 || (count < 0 && errno != EINTR))
            return Reading::Ended;
        length += static_cast<std::size_t>(std::max<ssize_t>(count, 0));
    }
    return Reading::Complete;
}

std::optional<Absence> askGuarded(SilentSources& sources, const std::string& source,
                                  GuardedChild::Task task, const void* question, void* answer,
                                  std::size_t size) {
    if (!sources.mayAsk(source))
        return Absence::TimedOut;
    const GuardedChild child(sources, task, question);
    switch (child.read(answer, size)) {
        case GuardedChild::Reading::Silent:
            sources.note(source);
            return Absence::TimedOut;
        case GuardedChild::Reading::Ended:
            return Absence::Unreadable;
        case GuardedChild::Reading::Complete:
            break;
    }
    return std::nullopt;
}

bool writeAnswer(int answers, const void* bytes, std::size_t size) {
    std::size_t length = 0;
    while (length < size) {
        const ssize_t count =
            ::write(answers, static_cast<const char*>(bytes) + length, size - length);
        if (count < 0 && errno != EINTR)
            return false;
        length += static_cast<std::size_t>(std::max<ssize_t>(count, 0));
    }
    return true;
}

}  // namespace cimomd
