#pragma once

// A provider cannot read its source: the operation that asked fails, nothing else.

#include <stdexcept>

namespace cimomd {

class ProviderError : public std::runtime_error {
  public:
    using std::runtime_error::runtime_error;
};

}  // namespace cimomd
