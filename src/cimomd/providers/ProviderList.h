#pragma once

// All providers of this machine. A new provider is registered here and nowhere else.

#include <memory>
#include <vector>

#include "providers/Provider.h"
#include "system/SystemCalls.h"
#include "system/SystemPaths.h"

namespace cimomd {

using ProviderList = std::vector<std::unique_ptr<Provider>>;

/// `calls` must outlive the providers.
ProviderList makeProviders(const SystemPaths& paths, const SystemCalls& calls);

}  // namespace cimomd
