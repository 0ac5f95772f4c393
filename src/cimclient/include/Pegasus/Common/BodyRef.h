// A counted pointer to a body whose class the holder's header need not know.
#pragma once

#include <Pegasus/Common/SharedBody.h>

#include <utility>

namespace Pegasus {

/// `Body` derives from SharedBody and may be incomplete except where get() is called.
template <class Body>
class BodyRef {
  public:
    BodyRef() noexcept = default;
    explicit BodyRef(SharedBody* body) noexcept : shared(body) {
        if (shared)
            shared->retain();
    }
    BodyRef(const BodyRef& other) noexcept : BodyRef(other.shared) {}
    BodyRef(BodyRef&& other) noexcept : shared(std::exchange(other.shared, nullptr)) {}
    ~BodyRef() {
        if (shared)
            shared->release();
    }
    BodyRef& operator=(BodyRef other) noexcept {
        std::swap(shared, other.shared);
        return *this;
    }

    explicit operator bool() const noexcept { return shared != nullptr; }
    Body* get() const noexcept { return static_cast<Body*>(shared); }

  private:
    SharedBody* shared = nullptr;
};

}  // namespace Pegasus
