// The body that copies of an Array share: a head and, behind it, room for the elements.
#pragma once

#include <Pegasus/Common/Config.h>
#include <Pegasus/Common/HandleCount.h>

#include <cstddef>
#include <memory>
#include <new>

namespace Pegasus {

/// Raw memory in one piece, so that an array costs one allocation. The elements up to `size` are
/// constructed.
template <class T>
class ArrayBody {
  public:
    /// A body with no elements and one handle. Raises std::bad_alloc.
    static ArrayBody* create(Uint32 capacity) {
        void* memory = ::operator new (offset() + std::size_t{capacity} * sizeof(T));
        return new (memory) ArrayBody(capacity);
    }

    void retain() noexcept { handles.increase(); }
    void release() noexcept {
        if (handles.decrease())
            destroy();
    }
    bool isShared() const noexcept { return handles.isShared(); }

    T* elements() noexcept {
        return reinterpret_cast<T*>(reinterpret_cast<unsigned char*>(this) + offset());
    }

    Uint32 size = 0;
    const Uint32 capacity;

  private:
    static_assert(alignof(T) <= __STDCPP_DEFAULT_NEW_ALIGNMENT__);

    static constexpr std::size_t offset() {
        return (sizeof(ArrayBody) + alignof(T) - 1) / alignof(T) * alignof(T);
    }

    explicit ArrayBody(Uint32 capacity) : capacity(capacity) {}

    void destroy() noexcept {
        std::destroy_n(elements(), size);
        this->~ArrayBody();
        ::operator delete(this);
    }

    HandleCount handles{1};
};

}  // namespace Pegasus
