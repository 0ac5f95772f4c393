// The array of the CIM client library. Copies share one body until one of them is changed.
//
// Distinct Array objects may be used from distinct threads also when they share a body; one object
// may not.
#pragma once

#include <Pegasus/Common/ArrayBody.h>
#include <Pegasus/Common/Config.h>

#include <algorithm>
#include <functional>
#include <limits>
#include <memory>
#include <new>
#include <utility>

namespace Pegasus {

/// Raises IndexOutOfBoundsException.
[[noreturn]] void throwIndexOutOfBounds(Uint32 index, Uint32 size);

/// Positions that do not exist raise IndexOutOfBoundsException, more elements than a Uint32 counts
/// std::bad_alloc; the array is unchanged then.
template <class T>
class Array {
  public:
    Array() noexcept = default;
    /// `n` elements that are default-constructed, or copies of `value`.
    explicit Array(Uint32 n) : Array(n, T()) {}
    Array(Uint32 n, const T& value) : Array() {
        constructAtEnd(n, [&](T* at) { std::uninitialized_fill_n(at, n, value); });
    }
    Array(const T* items, Uint32 n) : Array() { append(items, n); }
    Array(const Array& other) noexcept : body(other.body) {
        if (body)
            body->retain();
    }
    Array(Array&& other) noexcept : body(std::exchange(other.body, nullptr)) {}
    ~Array() {
        if (body)
            body->release();
    }
    Array& operator=(Array other) noexcept {
        std::swap(body, other.body);
        return *this;
    }

    void clear() noexcept { *this = Array(); }
    /// Makes room for `n` elements, so that appending up to there allocates no more.
    void reserveCapacity(Uint32 n) {
        if (n > capacity())
            replaceBody(n);
    }

    Uint32 size() const noexcept { return body ? body->size : 0; }
    /// The elements in one piece; null for an array that never had one. Valid until the array is
    /// changed, assigned or destroyed.
    const T* getData() const noexcept { return body ? body->elements() : nullptr; }
    const T* begin() const noexcept { return getData(); }
    const T* end() const noexcept { return getData() + size(); }

    const T& operator[](Uint32 index) const {
        requireIndex(index);
        return body->elements()[index];
    }
    /// The reference is to be used before the array is next copied: a write through it later would
    /// be seen in the copy.
    T& operator[](Uint32 index) {
        requireIndex(index);
        if (body->isShared())
            replaceBody(capacity());
        return body->elements()[index];
    }

    void append(T item) {
        constructAtEnd(1, [&](T* at) { new (at) T(std::move(item)); });
    }
    void append(const T* items, Uint32 n) {
        if (holds(items)) {
            const Array keepsItemsAlive(*this);
            constructAtEnd(n, [&](T* at) { std::uninitialized_copy_n(items, n, at); });
        } else {
            constructAtEnd(n, [&](T* at) { std::uninitialized_copy_n(items, n, at); });
        }
    }
    void appendArray(const Array& other) { append(other.getData(), other.size()); }
    void prepend(T item) { insert(0, std::move(item)); }
    void prepend(const T* items, Uint32 n) { insert(0, items, n); }
    /// Puts `item` before the element at `index`, or at the end for `index == size()`.
    void insert(Uint32 index, T item) {
        requirePosition(index);
        append(std::move(item));
        rotateInto(index, 1);
    }
    void insert(Uint32 index, const T* items, Uint32 n) {
        requirePosition(index);
        append(items, n);
        rotateInto(index, n);
    }

    void remove(Uint32 index) { remove(index, 1); }
    void remove(Uint32 index, Uint32 n) {
        requirePosition(index);
        if (n > size() - index)
            throwIndexOutOfBounds(index, size());
        if (n == 0)
            return;
        if (body->isShared())
            replaceBody(capacity());
        T* const elements = body->elements();
        std::move(elements + index + n, elements + body->size, elements + index);
        std::destroy_n(elements + body->size - n, n);
        body->size -= n;
    }

  private:
    Uint32 capacity() const noexcept { return body ? body->capacity : 0; }

    Boolean holds(const T* item) const {
        return !std::less<>()(item, begin()) && std::less<>()(item, end());
    }

    void requireIndex(Uint32 index) const {
        if (index >= size())
            throwIndexOutOfBounds(index, size());
    }

    void requirePosition(Uint32 index) const {
        if (index > size())
            throwIndexOutOfBounds(index, size());
    }

    /// Gives the array a body of its own with the same elements.
    void replaceBody(Uint32 newCapacity) {
        Array fresh;
        fresh.body = ArrayBody<T>::create(newCapacity);
        if (const Uint32 n = size()) {
            if (body->isShared())
                std::uninitialized_copy_n(body->elements(), n, fresh.body->elements());
            else
                std::uninitialized_move_n(body->elements(), n, fresh.body->elements());
            fresh.body->size = n;
        }
        std::swap(body, fresh.body);
    }

    /// Has `construct` make `n` elements behind the last one.
    template <class Construct>
    void constructAtEnd(Uint32 n, Construct construct) {
        if (n == 0)
            return;
        if (n > std::numeric_limits<Uint32>::max() - size())
            throw std::bad_alloc();
        const Uint32 needed = size() + n;
        if (needed > capacity())
            replaceBody(std::max({needed, kSmallest, capacity() + capacity() / 2}));
        else if (body->isShared())
            replaceBody(capacity());
        construct(body->elements() + body->size);
        body->size = needed;
    }

    void rotateInto(Uint32 index, Uint32 n) {
        if (n == 0)
            return;
        T* const elements = body->elements();
        std::rotate(elements + index, elements + size() - n, elements + size());
    }

    static constexpr Uint32 kSmallest = 4;

    ArrayBody<T>* body = nullptr;
};

}  // namespace Pegasus
