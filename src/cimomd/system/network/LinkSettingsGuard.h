#pragma once

// Asking a network driver that may never answer: a guarded child asks.

#include <string>

#include "system/SilentSources.h"
#include "system/network/DriverAnswer.h"

namespace cimomd {

class LinkSettingsGuard {
  public:
    /// Like `askDriver`.
    using Call = void (*)(const char* interfaceName, DriverAnswer& answer);

    explicit LinkSettingsGuard(Call driverCall = askDriver, const SilenceLimits& bounds = {})
        : call(driverCall), silent(bounds) {}

    /// What the driver of the interface tells; TimedOut when it does not answer in time, or was not
    /// asked because it or too many others did not answer before. May be called from several
    /// threads at once.
    LinkSettings ask(const std::string& interfaceName);

  private:
    Call call;
    SilentSources silent;
};

}  // namespace cimomd
