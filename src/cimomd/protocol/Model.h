#pragma once

// What an operation works on: the classes as they were when it began, and the providers.

#include <memory>

#include "providers/ProviderIndex.h"
#include "repository/ClassRepository.h"

namespace cimomd {

/// Copied into every answer, so that a reload takes nothing away from one that is being sent.
struct Model {
    std::shared_ptr<const ClassRepository> classes;
    /// Outlives all answers.
    const ProviderIndex* providers = nullptr;
};

}  // namespace cimomd
