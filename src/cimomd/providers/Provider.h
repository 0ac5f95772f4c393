#pragma once

// The source of the instances of one class.

#include <memory>

#include "providers/InstanceStream.h"
#include "providers/ProviderError.h"

namespace cimomd {

/// Providers keep no state between calls and may be called from several threads at once.
class Provider {
  public:
    virtual ~Provider() = default;

    /// The class of all instances; static text.
    virtual const char* className() const = 0;

    /// Every instance has every property of the class, null where the source gives no value, and
    /// all keys. The order and the keys are the same from call to call. Raises ProviderError when
    /// the source cannot be read.
    virtual std::unique_ptr<InstanceStream> enumerate() const = 0;

  protected:
    Provider() = default;
    Provider(const Provider&) = default;
    Provider& operator=(const Provider&) = default;
};

}  // namespace cimomd
