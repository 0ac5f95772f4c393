// How many handles share a body.
#pragma once

#include <Pegasus/Common/Config.h>
#include <sys/single_threaded.h>

#include <atomic>

namespace Pegasus {

/// Safe from several threads. A process that never had a second one is spared the cost of that,
/// which is most of what copying a handle costs.
class HandleCount {
  public:
    explicit HandleCount(Uint32 handles) noexcept : count(handles) {}

    void increase() noexcept {
        if (__libc_single_threaded)
            count.store(count.load(std::memory_order_relaxed) + 1, std::memory_order_relaxed);
        else
            count.fetch_add(1, std::memory_order_relaxed);
    }
    /// True when that was the last handle.
    Boolean decrease() noexcept {
        if (__libc_single_threaded) {
            const Uint32 left = count.load(std::memory_order_relaxed) - 1;
            count.store(left, std::memory_order_relaxed);
            return left == 0;
        }
        return count.fetch_sub(1, std::memory_order_acq_rel) == 1;
    }
    Boolean isShared() const noexcept { return count.load(std::memory_order_acquire) != 1; }

  private:
    std::atomic<Uint32> count;
};

}  // namespace Pegasus
