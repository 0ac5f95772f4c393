#pragma once

// The classes that are served at present. A reload puts others in their place; who took the old
// ones before keeps them until it is done.

#include <memory>
#include <mutex>
#include <utility>

#include "repository/ClassRepository.h"

namespace cimomd {

/// May be used from several threads at once.
class CurrentRepository {
  public:
    /// Never null, here and in replace.
    explicit CurrentRepository(std::shared_ptr<const ClassRepository> first)
        : current(std::move(first)) {}

    std::shared_ptr<const ClassRepository> get() const {
        const std::lock_guard lock(guard);
        return current;
    }

    void replace(std::shared_ptr<const ClassRepository> next) {
        const std::lock_guard lock(guard);
        current.swap(next);
    }

  private:
    mutable std::mutex guard;
    std::shared_ptr<const ClassRepository> current;
};

}  // namespace cimomd
