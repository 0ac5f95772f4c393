// What the handle classes share: a counted body.
#pragma once

#include <Pegasus/Common/HandleCount.h>

namespace Pegasus {

/// Counts the handles that refer to it. The count alone is safe from several threads.
class SharedBody {
  public:
    SharedBody() noexcept = default;
    /// The copy is a body of its own, with no handle yet.
    SharedBody(const SharedBody&) noexcept {}
    SharedBody& operator=(const SharedBody&) = delete;
    virtual ~SharedBody() = default;

    void retain() const noexcept { handles.increase(); }
    /// Deletes this body when the last handle lets go of it.
    void release() const noexcept {
        if (handles.decrease())
            destroy();
    }

  private:
    void destroy() const noexcept;

    mutable HandleCount handles{0};
};

}  // namespace Pegasus
