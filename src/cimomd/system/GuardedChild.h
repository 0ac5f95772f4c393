#pragma once

// Asking what may never answer. A system call that waits for a dead server or a hanging driver does
// not return, and no signal ends it. So a child process makes it, and what the child did not tell
// in time is not known.

#include <sys/types.h>

#include <cstddef>
#include <optional>
#include <string>
#include <type_traits>

#include "system/Fact.h"
#include "system/SilentSources.h"

namespace cimomd {

class GuardedChild {
  public:
    /// What the child does: writes answers to `question` to the descriptor `answers`. Between fork
    /// and exec of a process with threads: it must neither allocate nor lock anything.
    using Task = void (*)(const void* question, int answers);

    /// Starts the child. `question` must stay valid only until this returns; `sources` must outlive
    /// the child.
    GuardedChild(SilentSources& sources, Task task, const void* question);
    /// Ends the child.
    ~GuardedChild();
    GuardedChild(const GuardedChild&) = delete;
    GuardedChild& operator=(const GuardedChild&) = delete;

    enum class Reading { Complete, Ended, Silent };

    /// The next `size` bytes of the answers. Ended: there are not so many, or the child could not
    /// be started. Silent: they did not come before the deadline of the sources.
    Reading read(void* bytes, std::size_t size) const;

  private:
    SilentSources& sources;
    pid_t child = -1;
    int answers = -1;
};

/// Has a child put `size` bytes of answer into `answer`, unless `source` keeps it. Nothing when
/// they came; TimedOut when they did not, or when `source` did not answer lately; Unreadable when
/// the child ended without them.
std::optional<Absence> askGuarded(SilentSources& sources, const std::string& source,
                                  GuardedChild::Task task, const void* question, void* answer,
                                  std::size_t size);

/// For tasks: writes all of it; false when the reader is gone.
bool writeAnswer(int answers, const void* bytes, std::size_t size);

/// The same for an answer without padding, which is memory that nobody has set.
template <typename Answer>
bool writeAnswer(int answers, const Answer& answer) {
    static_assert(std::has_unique_object_representations_v<Answer>);
    return writeAnswer(answers, &answer, sizeof answer);
}

}  // namespace cimomd
