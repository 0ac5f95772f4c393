// The body that copies of a String share: a head and, behind it, the characters and a NUL.
#pragma once

#include <Pegasus/Common/Char16.h>
#include <Pegasus/Common/Config.h>
#include <Pegasus/Common/HandleCount.h>

#include <cstddef>
#include <new>

namespace Pegasus {

/// Raw memory in one piece, so that a string costs one allocation.
class StringBody {
  public:
    /// An empty text with one handle. Raises std::bad_alloc.
    static StringBody* create(Uint32 capacity) {
        const std::size_t characters = std::size_t{capacity} + 1;
        void* memory = ::operator new(sizeof(StringBody) + characters * sizeof(Char16));
        return new (memory) StringBody(capacity);
    }

    void retain() noexcept { handles.increase(); }
    void release() noexcept {
        if (handles.decrease())
            destroy();
    }
    Boolean isShared() const noexcept { return handles.isShared(); }

    Char16* text() noexcept { return reinterpret_cast<Char16*>(this + 1); }
    Uint32 size() const noexcept { return length; }
    Uint32 capacity() const noexcept { return room; }
    /// Has the text end at `size`, which is at most the capacity.
    void setSize(Uint32 size) noexcept {
        length = size;
        new (text() + size) Char16();
    }

  private:
    void destroy() noexcept;
    explicit StringBody(Uint32 capacity) noexcept : room(capacity) { setSize(0); }

    HandleCount handles{1};
    Uint32 length = 0;
    Uint32 room;
};

}  // namespace Pegasus
