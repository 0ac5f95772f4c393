#pragma once

// What the other providers could not tell, and why: each null of each instance, and each class that
// has no instances because its source is missing.

#include <vector>

#include "providers/Provider.h"

namespace cimomd {

class MissingValueProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_MissingValue";

    /// Asks the providers that are in the list now; they must outlive this one.
    explicit MissingValueProvider(const std::vector<std::unique_ptr<Provider>>& others);

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

  private:
    std::vector<const Provider*> providers;
};

}  // namespace cimomd
