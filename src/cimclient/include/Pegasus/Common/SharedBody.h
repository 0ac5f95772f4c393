// What the handle classes share: a counted body.
#pragma once

#include <Pegasus/Common/Config.h>

#include <atomic>

namespace Pegasus {

/// Counts the handles that refer to it. The count alone is safe from several threads.
class SharedBody {
  public:
    SharedBody() noexcept = default;
    /// The copy is a body of its own, with no handle yet.
    SharedBody(const SharedBody&) noexcept {}
    SharedBody& operator=(const SharedBody&) = delete;
    virtual ~SharedBody() = default;

    void retain() const noexcept { handles.fetch_add(1, std::memory_order_relaxed); }
    /// Deletes this body when the last handle lets go of it.
    void release() const noexcept {
        if (handles.fetch_sub(1, std::memory_order_acq_rel) == 1)
            destroy();
    }

  private:
    void destroy() const noexcept;

    mutable std::atomic<Uint32> handles{0};
};

}  // namespace Pegasus
